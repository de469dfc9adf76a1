#!/usr/bin/env bash
# Installs the Debian packages the game, its tests and its benchmarks need, when any is missing.
# `install-deps.sh fuzz` also installs clang and its sanitizer and libFuzzer runtimes (only recommended by clang,
# so named here), which the fuzz run (fuzz/run.sh) needs.
set -euo pipefail
packages=(cmake g++ make pkg-config libsdl2-dev libsdl2-ttf-dev libsdl2-image-dev
          fonts-liberation libgtest-dev libbenchmark-dev desktop-file-utils appstream)
[ "${1:-}" = fuzz ] && packages+=(clang libclang-rt-14-dev)
missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed' || missing+=("$p")
done
[ ${#missing[@]} -eq 0 ] && exit 0
echo "Installing: ${missing[*]}"
sudo=""
[ "$(id -u)" -eq 0 ] || sudo="sudo"
$sudo apt-get update -qq
DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y -qq "${missing[@]}"
