#!/usr/bin/env bash
# Every line of the README's C example must stand in the example program
# that the tests build and run, so the README never shows code that fails.
#   check_readme_example.sh README EXAMPLE
set -euo pipefail
readme=$1 example=$2
missing=0
while IFS= read -r line; do
  [ -z "${line// /}" ] && continue
  if ! grep -qxF -- "$line" "$example"; then
    echo "README line not in $(basename "$example"): $line"
    missing=1
  fi
done < <(awk '/^```c$/ {inside=1; next} /^```/ {inside=0} inside' "$readme")
exit $missing
