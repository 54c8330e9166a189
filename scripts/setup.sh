#!/usr/bin/env bash
# Installs what a fresh Debian machine lacks to build, test, fuzz and
# cross-test the library. Idempotent: quiet and quick when all is present.
#   scripts/setup.sh          library, tool, tests, fuzzer, 32-bit ARM and musl cross-testing
#   scripts/setup.sh --photos  the same, and the sample photographs of the demo
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)

native_packages=(
  g++ cmake make pkg-config
  libyajl-dev
  libpng-dev libjpeg62-turbo-dev libexif-dev libcli11-dev
  libgtest-dev googletest libbenchmark-dev
  clang libclang-rt-14-dev
  g++-arm-linux-gnueabihf qemu-user binutils
  musl-tools
)
armhf_packages=(libyajl-dev:armhf)

as_root() {
  if [ "$(id -u)" -eq 0 ]; then "$@"; else sudo "$@"; fi
}

missing() {
  local p
  for p in "$@"; do
    dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed' || echo "$p"
  done
}

want_armhf=0
if ! dpkg --print-foreign-architectures | grep -qx armhf; then
  as_root dpkg --add-architecture armhf
  want_armhf=1
fi

# Four freely licensed photographs (and the package's copyright file) from
# Debian's python3-skimage, unpacked from the archive without installing it.
fetch_photos() {
  local dest=$root/build/photos data=./usr/lib/python3/dist-packages/skimage/data
  local files=(coffee.png chelsea.png astronaut.png rocket.jpg)
  [ -f "$dest/rocket.jpg" ] && return 0
  local tmp
  tmp=$(mktemp -d)
  if ! (cd "$tmp" && apt-get download -qq python3-skimage >/dev/null 2>&1); then
    as_root apt-get update -qq >/dev/null 2>&1 || true
    (cd "$tmp" && apt-get download -qq python3-skimage >/dev/null 2>&1) || {
      echo "setup: error: could not download python3-skimage for the sample photos" >&2
      rm -rf "$tmp"
      return 1
    }
  fi
  dpkg-deb --fsys-tarfile "$tmp"/python3-skimage_*.deb |
    tar -x -C "$tmp" "${files[@]/#/$data/}" ./usr/share/doc/python3-skimage/copyright
  mkdir -p "$dest"
  cp "${files[@]/#/$tmp/$data/}" "$tmp/usr/share/doc/python3-skimage/copyright" "$dest/"
  rm -rf "$tmp"
  echo "setup: sample photos in $dest"
}

need=$(missing "${native_packages[@]}" "${armhf_packages[@]}")
if [ -z "$need" ] && [ "$want_armhf" -eq 0 ]; then
  if [ "${1:-}" = --photos ]; then fetch_photos; fi
  exit 0
fi

echo "setup: installing:" $need
# A mirror caught mid-sync can make one index fail; the installs below
# decide whether that mattered.
as_root apt-get update -qq >/dev/null 2>&1 || echo "setup: apt-get update reported errors; trying the installs anyway" >&2
# shellcheck disable=SC2086
if ! as_root env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends $need >/dev/null; then
  echo "setup: error: could not install:" $need >&2
  exit 1
fi
left=$(missing $need)
if [ -n "$left" ]; then
  echo "setup: error: still missing after install:" $left >&2
  exit 1
fi
echo "setup: done"
if [ "${1:-}" = --photos ]; then fetch_photos; fi
