#!/usr/bin/env bash
# Builds the library to WebAssembly and serves the browser page on localhost.
#   scripts/web.sh          install what is missing, build, serve on port 8080 (WEB_PORT)
#   scripts/web.sh build    install what is missing and build only
#   scripts/web.sh test     build, then the page's tests: the module under Node and
#                           the page in headless Chromium, against the native tool
#   scripts/web.sh bench    build, then the module under Node against the native
#                           library on the same work, alternating, in one run
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
jobs=$(nproc 2>/dev/null || echo 2)
what=${1:-serve}
case $what in
  serve | build | test | bench) ;;
  *) echo "web.sh: unknown command '$what' (serve, build, test, bench)" >&2; exit 2 ;;
esac

"$root/scripts/setup.sh" --web

# Debian's emscripten looks for Debian's JavaScript packages (its optimizer
# needs acorn) where Debian puts them.
export NODE_PATH=/usr/share/nodejs
yajl_source=$root/build/web-deps/yajl-$(dpkg-query -W -f='${Version}' "libyajl-dev:$(dpkg --print-architecture)")
build=$root/build/web
mkdir -p "$build"
# emcmake announces its command line; only a failure's output is shown.
if ! emcmake cmake -S "$root" -B "$build" -DCMAKE_BUILD_TYPE=Release -DYAJL_SOURCE_DIR="$yajl_source" \
  >"$build/configure.log" 2>&1; then
  cat "$build/configure.log" >&2
  exit 1
fi
cmake --build "$build" -j"$jobs" --target vorlite_web >/dev/null

# The native tool the tests and the benchmark hold the module against.
native() {
  cmake -S "$root" -B "$root/build/native" -DCMAKE_BUILD_TYPE=Release "$@" >/dev/null
  cmake --build "$root/build/native" -j"$jobs" --target vorlite >/dev/null
}

# Node 20's own fetch would take the module's file paths for URLs.
node_run() { node --no-experimental-fetch "$@"; }

case $what in
  serve)
    exec node "$root/web/serve.mjs" --port "${WEB_PORT:-8080}"
    ;;
  build)
    echo "web.sh: module in $build/web"
    ;;
  test)
    native
    node_run --test "$root/web/tests/module.test.mjs" "$root/web/tests/page.test.mjs"
    ;;
  bench)
    cmake --build "$build" -j"$jobs" --target vorlite_web_bench >/dev/null
    native_bench=$root/build/web-bench-native
    cmake -S "$root" -B "$native_bench" -DCMAKE_BUILD_TYPE=Release -DVORLITE_BUILD_WEB_BENCH=ON \
      -DVORLITE_BUILD_TESTS=OFF -DVORLITE_BUILD_CLI=OFF -DVORLITE_BUILD_EXAMPLES=OFF >/dev/null
    cmake --build "$native_bench" -j"$jobs" --target vorlite_web_bench >/dev/null
    node_run "$root/web/bench/compare.mjs" "$native_bench/web/vorlite_web_bench" "$build/web/vorlite_web_bench.js" \
      "${WEB_BENCH_ROUNDS:-5}"
    ;;
esac
