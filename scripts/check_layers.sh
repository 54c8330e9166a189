#!/usr/bin/env bash
# Checks that the library's folders depend one way:
#   core <- color <- tone <- generate <- legacy, and tools on color and tone;
#   the shared decoders of proclist (values.cpp, proclist_internal.h) serve
#   every adapter; the runner (the rest of proclist) may reach every folder.
# Two views of the same rule: the internal headers each source file
# includes, and the symbols each compiled object takes from another
# object (a call through the public header counts as much as an include).
#   check_layers.sh SOURCE_ROOT OBJECT_DIR [NM]
# OBJECT_DIR holds the library's objects as FOLDER/FILE.cpp.o, as CMake
# lays out an object library.
set -euo pipefail
root=$1
objects=$2
nm=${3:-nm}

# The layer of a source path relative to the root (folder/file), or nothing
# for files outside the library.
layer_of() {
  case $1 in
    proclist/values.cpp | proclist/proclist_internal.h) echo decoders ;;
    proclist/*) echo runner ;;
    core/* | color/* | tone/* | generate/* | legacy/* | tools/*) echo "${1%%/*}" ;;
  esac
}

# The layers a layer may use besides itself.
allowed() {
  case $1 in
    core) echo "" ;;
    decoders) echo "core" ;;
    color) echo "core decoders" ;;
    tone) echo "core decoders color" ;;
    generate) echo "core decoders color tone" ;;
    legacy) echo "core decoders color tone generate" ;;
    tools) echo "core decoders color tone" ;;
    runner) echo "core decoders color tone generate legacy tools" ;;
  esac
}

may_use() { # LAYER USED
  [ "$1" = "$2" ] && return 0
  local a
  for a in $(allowed "$1"); do [ "$a" = "$2" ] && return 0; done
  return 1
}

failures=0
complain() {
  echo "layering: $*" >&2
  failures=$((failures + 1))
}

cd "$root"
sources=$(find core color tone proclist generate legacy tools -maxdepth 1 \( -name '*.cpp' -o -name '*.h' \) 2>/dev/null | sort || true)

# Includes: "folder/name_internal.h", or a bare name inside the same folder.
for file in $sources; do
  layer=$(layer_of "$file")
  folder=${file%%/*}
  while IFS= read -r included; do
    [ -n "$included" ] || continue
    case $included in
      */*) target=$included ;;
      *) target=$folder/$included ;;
    esac
    [ -e "$target" ] || continue
    used=$(layer_of "$target")
    [ -n "$used" ] || continue
    may_use "$layer" "$used" || complain "$file ($layer) includes $included ($used)"
  done < <(sed -n 's/^[[:space:]]*#[[:space:]]*include[[:space:]]*"\([^"]*\)".*/\1/p' "$file")
done

# Symbols: who defines each strong global symbol, and who takes it.
cd "$objects"
object_files=$(find . -name '*.cpp.o' | sed 's|^\./||' | sort)
if [ -z "$object_files" ]; then
  echo "layering: no objects under $objects" >&2
  exit 1
fi
definitions=$(mktemp)
trap 'rm -f "$definitions"' EXIT
for object in $object_files; do
  "$nm" --defined-only -g "$object" | awk -v f="${object%.o}" '$2 ~ /^[TDBR]$/ { print $3, f }'
done | sort > "$definitions"

for object in $object_files; do
  source=${object%.o}
  layer=$(layer_of "$source")
  [ -n "$layer" ] || continue
  while read -r symbol owner; do
    [ "$owner" = "$source" ] && continue
    used=$(layer_of "$owner")
    may_use "$layer" "$used" ||
      complain "$source ($layer) uses $(echo "$symbol" | c++filt) of $owner ($used)"
  done < <("$nm" -u "$object" | awk '{ print $NF }' | sort -u | join - "$definitions")
done

if [ "$failures" -ne 0 ]; then
  echo "layering: $failures dependencies against the folder order" >&2
  exit 1
fi
echo "layering: every folder depends one way"
