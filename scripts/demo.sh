#!/usr/bin/env bash
# The main job: builds the vorlite tool, runs every bundled look of
# examples/effects/ on the sample photographs and writes before-and-after
# comparisons (original left, look right) to out/, then replays every brush
# script of examples/tools/ on the photo it names.
set -euo pipefail
cd "$(dirname "$0")/.."
"$PWD/scripts/setup.sh" --photos
cmake -S . -B build/native -DCMAKE_BUILD_TYPE=Release >/dev/null
cmake --build build/native -j"$(nproc 2>/dev/null || echo 2)" --target vorlite >/dev/null
tool=build/native/cli/vorlite
"$tool" info | head -n 2

mkdir -p out
count=0
for look in examples/effects/*.json; do
  name=$(basename "$look" .json)
  for photo in build/photos/*.png build/photos/*.jpg; do
    "$tool" apply "$look" "$photo" "out/$(basename "${photo%.*}")-$name.jpg" --compare --seed 1 --quality 88
    count=$((count + 1))
  done
done
scripts=0
for script in examples/tools/*.json; do
  name=$(basename "$script" .json)
  # Each brush script names the sample photo it was drawn for.
  photo=$(sed -n 's|^// photo: ||p' "$script")
  "$tool" paint "$script" "build/photos/$photo" "out/$(basename "${photo%.*}")-brush-$name.jpg" --compare --quality 88
  scripts=$((scripts + 1))
done
echo "demo: $count before-and-after comparisons of $(ls examples/effects/*.json | wc -l) looks" \
  "and $scripts brush edits in $PWD/out/"
