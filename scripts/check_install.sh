#!/usr/bin/env bash
# Installs a built tree into a scratch prefix and builds a host program
# against it twice: through the CMake package and through pkg-config.
#   check_install.sh BUILD_DIR
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
build=$(cd "$1" && pwd)
prefix=$build/install-check
rm -rf "$prefix" "$build/consumer"
cmake --install "$build" --prefix "$prefix" >/dev/null

cmake -S "$root/tests/install" -B "$build/consumer" -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
cmake --build "$build/consumer" >/dev/null
LD_LIBRARY_PATH=$prefix/lib:$prefix/lib/$(gcc -print-multiarch 2>/dev/null || true) "$build/consumer/consumer_shared" >/dev/null
"$build/consumer/consumer_static" >/dev/null
echo "install: CMake package links shared and static"

pcdir=$(dirname "$(find "$prefix" -name zentra_vorlite.pc | head -n 1)")
export PKG_CONFIG_PATH=$pcdir
cc -std=c99 -o "$build/consumer/consumer_pc" "$root/examples/run_effect.c" $(pkg-config --cflags --libs zentra_vorlite)
LD_LIBRARY_PATH=$(pkg-config --variable=libdir zentra_vorlite) "$build/consumer/consumer_pc" >/dev/null
cc -std=c99 -o "$build/consumer/consumer_pc_static" "$root/examples/run_effect.c" \
  $(pkg-config --cflags zentra_vorlite) "$(pkg-config --variable=libdir zentra_vorlite)/libzentra_vorlite.a" \
  $(pkg-config --libs-only-l --static zentra_vorlite | sed 's/-lzentra_vorlite//')
"$build/consumer/consumer_pc_static" >/dev/null
echo "install: pkg-config links shared and static"
