#!/usr/bin/env bash
# Installs what a fresh Debian machine lacks to build, test, fuzz and
# cross-test the library. Idempotent: quiet and quick when all is present.
#   scripts/setup.sh          library, tests, fuzzer and 32-bit ARM cross-testing
set -euo pipefail

native_packages=(
  g++ cmake make pkg-config
  libyajl-dev
  libgtest-dev googletest libbenchmark-dev
  clang libclang-rt-14-dev
  g++-arm-linux-gnueabihf qemu-user binutils
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

need=$(missing "${native_packages[@]}" "${armhf_packages[@]}")
[ -z "$need" ] && [ "$want_armhf" -eq 0 ] && exit 0

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
