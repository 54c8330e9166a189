#!/usr/bin/env bash
# Builds and runs every test of the library:
#   native    the suite, natively
#   fma-off   the native suite again with glibc's fused multiply-add variants
#             off, so that its elementary functions are the reference ones the
#             suite compares ours with
#   musl      the elementary-function checker built against musl: the pinned
#             results whatever the C library
#   sanitize  the suite under AddressSanitizer and UndefinedBehaviorSanitizer
#   tsan      one loaded document on eight threads, and a batch of the tool
#             on eight jobs, under ThreadSanitizer
#   arm       the suite cross-built for 32-bit ARM hard-float, under qemu-arm
#   install   cmake --install, then a CMake and a pkg-config consumer
#   web       the library built to WebAssembly: its module under Node and the
#             browser page in headless Chromium against the native tool
#   fuzz      the effect-document fuzzer for FUZZ_SECONDS (default 60)
# With no arguments every stage runs, in that order.
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
jobs=$(nproc 2>/dev/null || echo 2)
stages=("$@")
[ ${#stages[@]} -eq 0 ] && stages=(native fma-off musl sanitize tsan arm install web fuzz)

"$root/scripts/setup.sh"

banner() { printf '\n==== %s\n' "$*"; }

suite() { # NAME [cmake options...]
  local dir="$root/build/$1"; shift
  cmake -S "$root" -B "$dir" -DCMAKE_BUILD_TYPE=Release "$@" >/dev/null
  cmake --build "$dir" -j"$jobs" >/dev/null
  (cd "$dir" && ctest -j"$jobs" --output-on-failure)
}

# scripts/check_math.cpp and core/math_float.cpp against musl, linked
# statically. GoogleTest is not built for musl, and the library's other
# files are not needed: the checker holds the known and special cases and
# the sample checksums the native suite pins. libstdc++'s headers are
# header-only here; their GNU/Linux configuration asks for glibc's version
# macro, which musl does not have.
musl_checker() {
  local dir=$root/build/musl arch
  arch=$(gcc -dumpmachine | sed 's/-linux-gnu$//')
  mkdir -p "$dir/include"
  ln -sfn /usr/include/yajl "$dir/include/yajl"
  # musl's compiler wrapper, with g++ behind it for the C++ files.
  local cxx=(env REALGCC=g++ musl-gcc -std=c++20 -O2 -ffp-contract=off -fno-fast-math -fno-exceptions -fno-rtti
    -nostdinc
    -isystem "/usr/include/c++/$(g++ -dumpversion)"
    -isystem "/usr/include/$arch-linux-gnu/c++/$(g++ -dumpversion)"
    -isystem "/usr/include/$arch-linux-musl" -isystem "$(g++ -print-file-name=include)"
    -isystem "$dir/include" '-D__GLIBC_PREREQ(major,minor)=0' -I"$root" -I"$root/include")
  "${cxx[@]}" -c "$root/core/math_float.cpp" -o "$dir/math_float.o"
  "${cxx[@]}" -c "$root/scripts/check_math.cpp" -o "$dir/check_math.o"
  musl-gcc -static "$dir/check_math.o" "$dir/math_float.o" -o "$dir/check_math" -lm
  "$dir/check_math" self
}

for stage in "${stages[@]}"; do
  case $stage in
    native)
      banner "native suite"
      suite native
      ;;
    fma-off)
      banner "native suite with glibc's fused multiply-add variants off"
      GLIBC_TUNABLES=glibc.cpu.hwcaps=-FMA,-AVX2 suite native
      ;;
    musl)
      banner "elementary functions built against musl"
      musl_checker
      ;;
    sanitize)
      banner "suite under AddressSanitizer and UndefinedBehaviorSanitizer"
      suite sanitize -DVORLITE_SANITIZE=address,undefined
      ;;
    tsan)
      banner "threads under ThreadSanitizer"
      dir=$root/build/tsan
      cmake -S "$root" -B "$dir" -DCMAKE_BUILD_TYPE=Release -DVORLITE_SANITIZE=thread >/dev/null
      cmake --build "$dir" -j"$jobs" --target vorlite_thread_tests vorlite_cli_tests vorlite >/dev/null
      export TSAN_OPTIONS=halt_on_error=1
      "$dir/tests/vorlite_thread_tests"
      "$dir/cli/tests/vorlite_cli_tests" --gtest_filter='*Batch*'
      ;;
    arm)
      banner "suite on 32-bit ARM hard-float under qemu-arm"
      suite arm -DCMAKE_TOOLCHAIN_FILE="$root/cmake/arm-linux-gnueabihf.cmake"
      ;;
    install)
      banner "install and consume"
      "$root/scripts/check_install.sh" "$root/build/native"
      ;;
    web)
      banner "WebAssembly module and browser page"
      "$root/scripts/web.sh" test
      ;;
    fuzz)
      banner "effect-document fuzzer, ${FUZZ_SECONDS:-60} s"
      "$root/scripts/fuzz.sh" "${FUZZ_SECONDS:-60}"
      ;;
    *)
      echo "test.sh: unknown stage '$stage' (native, fma-off, musl, sanitize, tsan, arm, install, web, fuzz)" >&2
      exit 2
      ;;
  esac
done
