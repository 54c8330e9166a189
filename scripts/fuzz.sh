#!/usr/bin/env bash
# Builds the effect-document fuzzer with clang and runs it for N seconds
# (default 60) from the seed corpus. The loader's deliberate leak of a tree
# without the envelope is suppressed by name; any other leak is a finding.
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
seconds=${1:-60}
dir=$root/build/fuzz

CC=clang CXX=clang++ cmake -S "$root" -B "$dir" -DCMAKE_BUILD_TYPE=RelWithDebInfo \
  -DVORLITE_BUILD_FUZZ=ON -DVORLITE_BUILD_TESTS=OFF -DVORLITE_BUILD_EXAMPLES=OFF \
  -DVORLITE_SANITIZE=address,undefined -DCMAKE_CXX_FLAGS=-fsanitize=fuzzer-no-link >/dev/null
cmake --build "$dir" -j"$(nproc)" --target fuzz_effect_document >/dev/null

# The fuzzer grows its own corpus; the seeds in the repository stay as they are.
rm -rf "$dir/corpus" "$dir/findings"
mkdir -p "$dir/corpus" "$dir/findings"
cp "$root"/fuzz/corpus/* "$dir/corpus/"

# The slow unwinder sees through yajl's frames, so the suppression can
# match the loader by name.
export ASAN_OPTIONS=fast_unwind_on_malloc=0:detect_leaks=1
export LSAN_OPTIONS=suppressions=$root/scripts/lsan.supp:print_suppressions=0
export UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1
status=0
"$dir/fuzz/fuzz_effect_document" -max_total_time="$seconds" -max_len=8192 -rss_limit_mb=4096 \
  -timeout=10 -print_final_stats=1 -dict="$root/fuzz/effect_document.dict" \
  -artifact_prefix="$dir/findings/" "$dir/corpus" >"$dir/fuzz.log" 2>&1 || status=$?
grep -E '^(#[0-9]+ +DONE|Done |stat::number_of_executed_units|stat::peak_rss_mb)' "$dir/fuzz.log" || true
if [ $status -ne 0 ]; then
  tail -n 60 "$dir/fuzz.log" >&2
  echo "fuzz: failed (exit $status); artifacts in $dir/findings" >&2
  exit 1
fi
echo "fuzz: ${seconds} s without a finding"
