#!/usr/bin/env bash
# Measures where the C libraries' double-precision exp, log, pow, sin, cos
# and atan2 disagree on the arguments the library passes, and checks the
# library's own versions against glibc without fused multiply-add (whose
# arithmetic is the 32-bit ARM reference's). Needs musl-tools; with --arm
# also runs 32-bit ARM glibc under qemu-arm (slow: an hour or more).
# Results stream through named pipes, so nothing large touches the disk.
#   scripts/measure_double_math.sh [--arm]
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
with_arm=0
[ "${1:-}" = "--arm" ] && with_arm=1

command -v musl-gcc >/dev/null || { echo "measure: needs musl-gcc (apt-get install musl-tools)" >&2; exit 1; }
grep -qw fma /proc/cpuinfo || echo "measure: note: this CPU has no FMA; the fma-on column equals fma-off" >&2

flags=(-O2 -ffp-contract=off -Wall -Wextra)
gcc "${flags[@]}" -std=c11 -o "$work/glibc" scripts/measure_double_math.c -lm
musl-gcc "${flags[@]}" -std=c11 -static -o "$work/musl" scripts/measure_double_math.c -lm
g++ "${flags[@]}" -std=c++20 -I"$root" -I"$root/include" -o "$work/compare" \
  scripts/measure_double_math.cpp core/math_double.cpp
streams=(on.out off.out musl.out)
mkfifo "$work/on.out" "$work/off.out" "$work/musl.out"
nice "$work/glibc" >"$work/on.out" &
GLIBC_TUNABLES=glibc.cpu.hwcaps=-FMA,-AVX2 nice "$work/glibc" >"$work/off.out" &
nice "$work/musl" >"$work/musl.out" &
if [ $with_arm -eq 1 ]; then
  arm-linux-gnueabihf-gcc "${flags[@]}" -std=c11 -static -o "$work/arm" scripts/measure_double_math.c -lm
  mkfifo "$work/arm.out"
  nice qemu-arm "$work/arm" >"$work/arm.out" &
  streams+=(arm.out)
fi
nice "$work/compare" "${streams[@]/#/$work/}"
