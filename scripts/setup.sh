#!/usr/bin/env bash
# Installs what a fresh Debian machine lacks to build, test, fuzz and
# cross-test the library. Idempotent: quiet and quick when all is present.
#   scripts/setup.sh          library, tool, tests, fuzzer, 32-bit ARM and musl cross-testing
#   scripts/setup.sh --photos  the same, and the sample photographs of the demo
#   scripts/setup.sh --web     the same, and what the browser page needs: emscripten,
#                              Node.js and npm, Chromium, the page tests' driver, and
#                              yajl's source (the machine's own version) to build for it
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
web_packages=(emscripten chromium dpkg-dev)

photos=0
web=0
for arg in "$@"; do
  case $arg in
    --photos) photos=1 ;;
    --web) web=1 ;;
    *) echo "setup: unknown option '$arg' (--photos, --web)" >&2; exit 2 ;;
  esac
done

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

# Debian's source package of the yajl the machine has, unpacked into
# build/web-deps for the WebAssembly build. apt needs the archive's source
# lines for that: they are enabled beside its binary ones.
fetch_yajl_source() {
  local dest=$root/build/web-deps version
  version=$(dpkg-query -W -f='${Version}' "libyajl-dev:$(dpkg --print-architecture)")
  [ -f "$dest/yajl-$version/src/yajl_tree.c" ] && return 0
  if ! apt-get source --print-uris -qq "yajl=$version" 2>/dev/null | grep -q "yajl_"; then
    local f
    for f in /etc/apt/sources.list.d/*.sources; do
      [ -f "$f" ] && grep -q '^URIs:.*/debian' "$f" && as_root sed -i -E 's/^Types: deb$/Types: deb deb-src/' "$f"
    done
    if [ -f /etc/apt/sources.list ] && ! grep -q '^deb-src' /etc/apt/sources.list; then
      sed -n 's/^deb \(.*debian.*\)/deb-src \1/p' /etc/apt/sources.list | as_root tee -a /etc/apt/sources.list >/dev/null
    fi
    as_root apt-get update -qq >/dev/null 2>&1 || true
  fi
  local tmp
  tmp=$(mktemp -d)
  (cd "$tmp" && apt-get source -qq "yajl=$version" >/dev/null 2>&1) || {
    echo "setup: error: could not fetch Debian's source of yajl $version" >&2
    rm -rf "$tmp"
    return 1
  }
  mkdir -p "$dest"
  rm -rf "$dest/yajl-$version"
  mv "$tmp"/yajl-*/ "$dest/yajl-$version"
  rm -rf "$tmp"
  echo "setup: yajl $version source in $dest/yajl-$version"
}

# The page tests' browser driver, from the npm registry at the locked
# version; it drives Debian's Chromium and downloads no browser of its own.
install_driver() {
  local dir=$root/web/tests
  [ -d "$dir/node_modules/puppeteer-core" ] && return 0
  (cd "$dir" && PUPPETEER_SKIP_DOWNLOAD=1 npm ci --no-audit --no-fund --loglevel=error >/dev/null) || {
    echo "setup: error: npm could not install the page tests' driver" >&2
    return 1
  }
}

finish() {
  if [ "$photos" -eq 1 ] || [ "$web" -eq 1 ]; then fetch_photos; fi
  if [ "$web" -eq 1 ]; then
    fetch_yajl_source
    install_driver
  fi
}

wanted=("${native_packages[@]}" "${armhf_packages[@]}")
if [ "$web" -eq 1 ]; then
  wanted+=("${web_packages[@]}")
  # Node.js may come from elsewhere than Debian with npm inside it.
  command -v node >/dev/null || wanted+=(nodejs)
  command -v npm >/dev/null || wanted+=(npm)
fi
need=$(missing "${wanted[@]}")
if [ -z "$need" ] && [ "$want_armhf" -eq 0 ]; then
  finish
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
finish
