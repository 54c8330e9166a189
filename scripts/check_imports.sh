#!/usr/bin/env bash
# Fails when the shared library takes an elementary function (exp, log,
# pow, sin, cos, ...) from the C maths library: the C library's results
# differ between CPUs and C libraries, while the library's own in core/
# give the same bits everywhere. sqrt and floor are exact everywhere and
# stay allowed.
#   check_imports.sh LIBRARY [NM]
set -euo pipefail
library=$1
nm=${2:-nm}
elementary='^(exp|exp2|expm1|log|log2|log10|log1p|pow|sin|cos|tan|sincos|asin|acos|atan|atan2|sinh|cosh|tanh|asinh|acosh|atanh|cbrt|hypot|erf|erfc|lgamma|tgamma)[fl]?$'
imported=$("$nm" -D --undefined-only "$library" | awk '{print $NF}' | sed 's/@.*//' | grep -E "$elementary" || true)
if [ -n "$imported" ]; then
  echo "imports from the C maths library:" $imported
  exit 1
fi
echo "imports: no elementary function from the C maths library"
