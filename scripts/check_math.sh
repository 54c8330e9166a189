#!/usr/bin/env bash
# Holds the library's single-precision elementary functions
# (core/math_float.cpp) against the C library on every float argument of
# expf, logf, sinf and cosf and on some 4 x 10^9 powf pairs: grids near 1,
# random patterns, and each constant exponent of the library over every
# float base it can meet. glibc's fused multiply-add variants are switched
# off, so that its results are the reference ones. Runs on every core;
# prints the differences per family (all must be 0) and the wall time.
# About two and a half minutes on two cores.
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
dir=$root/build/check_math

"$root/scripts/setup.sh"

mkdir -p "$dir"
g++ -std=c++20 -O2 -ffp-contract=off -fno-fast-math -Wall -Wextra -I"$root" -I"$root/include" \
  "$root/scripts/check_math.cpp" "$root/core/math_float.cpp" -o "$dir/check_math" -pthread
start=$SECONDS
status=0
GLIBC_TUNABLES=glibc.cpu.hwcaps=-FMA,-AVX2 "$dir/check_math" reference "$(nproc 2>/dev/null || echo 2)" ||
  status=$?
echo "check_math: $((SECONDS - start)) s wall clock"
exit $status
