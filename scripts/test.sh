#!/usr/bin/env bash
# Builds and runs every test of the library:
#   native    the suite, natively
#   sanitize  the suite under AddressSanitizer and UndefinedBehaviorSanitizer
#   arm       the suite cross-built for 32-bit ARM hard-float, under qemu-arm
#   install   cmake --install, then a CMake and a pkg-config consumer
#   fuzz      the effect-document fuzzer for FUZZ_SECONDS (default 60)
# With no arguments every stage runs, in that order.
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
jobs=$(nproc 2>/dev/null || echo 2)
stages=("$@")
[ ${#stages[@]} -eq 0 ] && stages=(native sanitize arm install fuzz)

"$root/scripts/setup.sh"

banner() { printf '\n==== %s\n' "$*"; }

suite() { # NAME [cmake options...]
  local dir="$root/build/$1"; shift
  cmake -S "$root" -B "$dir" -DCMAKE_BUILD_TYPE=Release "$@" >/dev/null
  cmake --build "$dir" -j"$jobs" >/dev/null
  (cd "$dir" && ctest -j"$jobs" --output-on-failure)
}

for stage in "${stages[@]}"; do
  case $stage in
    native)
      banner "native suite"
      suite native
      ;;
    sanitize)
      banner "suite under AddressSanitizer and UndefinedBehaviorSanitizer"
      suite sanitize -DVORLITE_SANITIZE=address,undefined
      ;;
    arm)
      banner "suite on 32-bit ARM hard-float under qemu-arm"
      suite arm -DCMAKE_TOOLCHAIN_FILE="$root/cmake/arm-linux-gnueabihf.cmake"
      ;;
    install)
      banner "install and consume"
      "$root/scripts/check_install.sh" "$root/build/native"
      ;;
    fuzz)
      banner "effect-document fuzzer, ${FUZZ_SECONDS:-60} s"
      "$root/scripts/fuzz.sh" "${FUZZ_SECONDS:-60}"
      ;;
    *)
      echo "test.sh: unknown stage '$stage' (native, sanitize, arm, install, fuzz)" >&2
      exit 2
      ;;
  esac
done
