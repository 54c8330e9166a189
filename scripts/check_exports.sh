#!/usr/bin/env bash
# Compares the names a shared library exports with the names its public
# header declares: both directions must match exactly.
#   check_exports.sh HEADER LIBRARY
set -euo pipefail
header=$1 library=$2
# Each exported declaration starts with VOR_API; the name is the identifier
# just before its parameter list, initialiser or semicolon.
declared=$(sed -n 's/^VOR_API[^(=;]*[^A-Za-z0-9_]\([A-Za-z_][A-Za-z0-9_]*\)[[:space:]]*[(=;].*/\1/p' "$header" | sort -u)
exported=$(nm -D --defined-only "$library" | awk '{print $NF}' | sort -u)
missing=$(comm -23 <(echo "$declared") <(echo "$exported"))
extra=$(comm -13 <(echo "$declared") <(echo "$exported"))
status=0
if [ -n "$missing" ]; then echo "declared but not exported:" $missing; status=1; fi
if [ -n "$extra" ]; then echo "exported but not declared:" $extra; status=1; fi
[ $status -eq 0 ] && echo "exports: $(echo "$declared" | wc -l) names, exactly the interface"
exit $status
