#!/usr/bin/env bash
# Builds the library and runs the example host: it loads an effect document
# and runs it on a generated bitmap.
set -euo pipefail
cd "$(dirname "$0")/.."
"$PWD/scripts/setup.sh"
cmake -S . -B build/native -DCMAKE_BUILD_TYPE=Release >/dev/null
cmake --build build/native -j"$(nproc 2>/dev/null || echo 2)" --target run_effect >/dev/null
build/native/examples/run_effect
