#!/usr/bin/env bash
# Measures the library against OpenCV and libvips on a scaled-up sample
# photo and rewrites bench/RESULTS.md. Installs the peers from Debian when
# missing (idempotent), builds, runs the harness's own checks,
# then the benchmarks: every pair with the peers on one thread, the peers
# again on every core, the library again with each bitmap starting outside
# the core's caches, the command-line tool's peak memory, and the tool
# against `vips copy` on a 12-megapixel JPEG written to PNG and to JPEG.
#   BENCH_REPETITIONS=N   repetitions per benchmark (default 5)
#   BENCH_FILTER=REGEX    only the benchmarks whose name matches (quick looks)
#   BENCH_BUILD=DIR       build directory (default build/bench)
#   BENCH_TOOL_ROUNDS=N   alternating rounds of the tool and vips (default 9)
set -euo pipefail
cd "$(dirname "$0")/.."
root=$PWD
build=${BENCH_BUILD:-$root/build/bench}
repetitions=${BENCH_REPETITIONS:-5}
filter=${BENCH_FILTER:-.}

as_root() {
  if [ "$(id -u)" -eq 0 ]; then "$@"; else sudo "$@"; fi
}

"$root/scripts/setup.sh" --photos

# The peers, libvips's command-line tool, GNU time and bc. Another
# engineer may be installing at the same moment: wait for dpkg's lock
# rather than fail.
peers=(libopencv-dev libvips-dev libvips-tools time bc)
need=()
for p in "${peers[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed' || need+=("$p")
done
if [ ${#need[@]} -gt 0 ]; then
  echo "bench: installing: ${need[*]}"
  as_root apt-get -o DPkg::Lock::Timeout=300 update -qq >/dev/null 2>&1 || true
  as_root env DEBIAN_FRONTEND=noninteractive apt-get -o DPkg::Lock::Timeout=300 install -y -qq \
    --no-install-recommends "${need[@]}" >/dev/null
fi

photo=$root/build/photos/coffee.png
[ -f "$photo" ] || { echo "bench: error: no sample photo at $photo" >&2; exit 1; }

cmake -S "$root" -B "$build" -DCMAKE_BUILD_TYPE=Release -DVORLITE_BUILD_BENCH=ON >/dev/null
targets=(vorlite_bench vorlite_bench_report vorlite_bench_tests)
have_tool=0
# The command-line tool is measured when this tree has it.
known_targets=$(cmake --build "$build" --target help)
if grep -qE '^\.\.\. vorlite( |$)' <<<"$known_targets"; then
  targets+=(vorlite)
  have_tool=1
fi
cmake --build "$build" -j"$(nproc 2>/dev/null || echo 2)" --target "${targets[@]}" >/dev/null

echo "bench: checking that each peer does the same work as the library"
"$build/bench/vorlite_bench_tests" --gtest_brief=1

documents=()
for d in "$root"/examples/effects/*.json; do
  [ -f "$d" ] && documents+=("--document=${d#"$root"/}")
done
common=(--photo="${photo#"$root"/}" --benchmark_repetitions="$repetitions"
  --benchmark_report_aggregates_only=true --benchmark_out_format=json)

echo "bench: the library and its peers, peers on one thread"
"$build/bench/vorlite_bench" "${common[@]}" "${documents[@]}" --benchmark_filter="$filter" \
  --benchmark_out="$build/single.json"
echo "bench: the peers on every core"
# The library runs on one thread whatever the setting: only the peers again.
peer_filter=$filter
[ "$filter" = . ] && peer_filter='/(opencv|vips)/'
"$build/bench/vorlite_bench" "${common[@]}" --peer-threads=all \
  --benchmark_filter="$peer_filter" --benchmark_out="$build/multi.json"

echo "bench: the library again, each copy first pushed out of the core's caches"
ours_filter=$filter
[ "$filter" = . ] && ours_filter='/ours/'
"$build/bench/vorlite_bench" "${common[@]}" "${documents[@]}" --evict-caches \
  --benchmark_filter="$ours_filter" --benchmark_out="$build/cold.json"

memory=()
if [ "$have_tool" -eq 1 ]; then
  echo "bench: the command-line tool's peak memory on a 12-megapixel photo"
  large=$build/photo-12mp.png
  "$build/bench/vorlite_bench" --photo="$photo" --write-photo="$large"
  document=$(sed -n 's/^ *"document": "\(.*\)",\{0,1\}$/\1/p' "$build/single.json" | head -n 1)
  [ -n "$document" ] || document=examples/effects/warm-crisp-grain.json
  /usr/bin/time -v "$build/cli/vorlite" apply "$root/$document" "$large" "$build/photo-12mp-out.png" \
    2>"$build/time.txt" >/dev/null
  peak=$(sed -n 's/.*Maximum resident set size (kbytes): *\([0-9]*\).*/\1/p' "$build/time.txt")
  memory=(--peak-rss-kb="$peak" --bitmap-bytes=$((4000 * 3000 * 4))
    --memory-note="vorlite apply $document on the sample photo scaled to 4000 x 3000 (PNG), peak resident set size from /usr/bin/time -v")

  echo "bench: the command-line tool against vips copy on a 12-megapixel JPEG"
  jpeg=$build/photo-12mp.jpg
  vips copy "$large" "$jpeg"
  tool_out=$build/tool-out
  mkdir -p "$tool_out"
  # Wall-clock seconds of one command, its output thrown away.
  seconds() {
    local start end
    start=$(date +%s.%N)
    "$@" >/dev/null 2>&1
    end=$(date +%s.%N)
    echo "$end - $start" | bc -l
  }
  median() { sort -g | awk '{ v[NR] = $1 } END { print (NR % 2) ? v[(NR + 1) / 2] : (v[NR / 2] + v[NR / 2 + 1]) / 2 }'; }
  rounds=${BENCH_TOOL_ROUNDS:-9}
  : >"$build/tool-png.txt"; : >"$build/vips-png.txt"; : >"$build/tool-jpg.txt"; : >"$build/vips-jpg.txt"
  # The contenders alternate, round after round, so a busy moment of the
  # machine falls on all of them alike.
  for _ in $(seq "$rounds"); do
    seconds "$build/cli/vorlite" apply "$root/$document" "$jpeg" "$tool_out/ours.png" >>"$build/tool-png.txt"
    seconds vips copy "$jpeg" "$tool_out/vips.png" >>"$build/vips-png.txt"
    seconds "$build/cli/vorlite" apply "$root/$document" "$jpeg" "$tool_out/ours.jpg" >>"$build/tool-jpg.txt"
    seconds vips copy "$jpeg" "$tool_out/vips.jpg" >>"$build/vips-jpg.txt"
  done
  "$build/cli/vorlite" apply "$root/$document" "$jpeg" "$tool_out/libpng-defaults.png" --png-level 6 >/dev/null
  size() { stat -c %s "$1"; }
  tool_png=$(median <"$build/tool-png.txt"); vips_png=$(median <"$build/vips-png.txt")
  tool_jpg=$(median <"$build/tool-jpg.txt"); vips_jpg=$(median <"$build/vips-jpg.txt")
  png_ratio=$(echo "$tool_png / $vips_png" | bc -l)
  jpg_ratio=$(echo "$tool_jpg / $vips_jpg" | bc -l)
  size_ratio=$(echo "$(size "$tool_out/ours.png") / $(size "$tool_out/libpng-defaults.png")" | bc -l)
  verdict() { if [ "$(echo "$1 <= $2" | bc -l)" -eq 1 ]; then echo yes; else echo no; fi; }
  {
    echo "## The command-line tool"
    echo
    echo "\`vorlite apply $document\` on the sample photo scaled to 4000 x 3000 and saved as JPEG by \`vips copy\`, against \`vips copy\` of the same file with its defaults; wall-clock medians of $rounds alternating rounds, in seconds. The tool's time includes decoding, the effect and encoding; \`vips copy\` only decodes and encodes."
    echo
    echo "| output | vorlite apply | vips copy | ratio | goal | met | file, vorlite | file, vips |"
    echo "|---|---:|---:|---:|---:|---|---:|---:|"
    printf '| PNG | %.2f | %.2f | %.2f | <= 1.30 | %s | %.1f MB | %.1f MB |\n' "$tool_png" "$vips_png" "$png_ratio" \
      "$(verdict "$png_ratio" 1.3)" "$(echo "$(size "$tool_out/ours.png") / 1000000" | bc -l)" \
      "$(echo "$(size "$tool_out/vips.png") / 1000000" | bc -l)"
    printf '| JPEG | %.2f | %.2f | %.2f | - | - | %.1f MB | %.1f MB |\n' "$tool_jpg" "$vips_jpg" "$jpg_ratio" \
      "$(echo "$(size "$tool_out/ours.jpg") / 1000000" | bc -l)" "$(echo "$(size "$tool_out/vips.jpg") / 1000000" | bc -l)"
    echo
    printf 'The default PNG is %.1f MB, %.2f times what libpng'"'"'s defaults make of the same pixels (%.1f MB with \`--png-level 6\`: zlib level 6, adaptive filters); goal <= 1.15: %s.\n' \
      "$(echo "$(size "$tool_out/ours.png") / 1000000" | bc -l)" "$size_ratio" \
      "$(echo "$(size "$tool_out/libpng-defaults.png") / 1000000" | bc -l)" "$(verdict "$size_ratio" 1.15)"
  } >"$build/tool.md"
  memory+=(--append="$build/tool.md")
else
  memory=(--memory-note="the command-line tool vorlite is not built in this tree")
fi

model=$(sed -n 's/^model name[[:space:]]*: //p' /proc/cpuinfo | head -n 1)
mem_gib=$(awk '/^MemTotal/ { printf "%.0f", $2 / 1048576 }' /proc/meminfo)
compiler=$(c++ --version | head -n 1)
machine="$model, $(nproc) cores, $mem_gib GiB, Linux $(uname -r), $compiler, other programs running: load average $(cut -d' ' -f1-3 /proc/loadavg)"
"$build/bench/vorlite_bench_report" --single="$build/single.json" --multi="$build/multi.json" \
  --cold="$build/cold.json" \
  --machine="$machine" --date="$(date -u '+%Y-%m-%d %H:%M UTC')" "${memory[@]}" --out="$root/bench/RESULTS.md"
echo "bench: wrote bench/RESULTS.md"
cat "$root/bench/RESULTS.md"
