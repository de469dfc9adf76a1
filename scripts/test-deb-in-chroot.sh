#!/usr/bin/env bash
# Installs the .deb made by `cpack -G DEB` into a fresh minimal Debian 12 (debootstrap) and starts the
# installed game there headless, as the menu starts it and from a terminal: it must find every picture, sound
# and font, and keep its progress in the per-user folder. Needs root, debootstrap and the Debian mirror; takes
# minutes, so CI does not run it.
# Usage: scripts/test-deb-in-chroot.sh [PACKAGE.deb]     (default: the newest kruszarka_*.deb in build/)
set -euo pipefail
here="$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)"
deb="${1:-$(ls -t "$here"/build/kruszarka_*.deb 2> /dev/null | head -1)}"
[ -f "$deb" ] || { echo "no package: run cpack -G DEB in build/ first" >&2; exit 2; }
[ "$(id -u)" -eq 0 ] || { echo "needs root (debootstrap, chroot)" >&2; exit 2; }
command -v debootstrap > /dev/null || { echo "needs debootstrap: apt-get install debootstrap" >&2; exit 2; }
mirror="${KRUSZARKA_MIRROR:-http://deb.debian.org/debian}"
# Downloaded packages are kept between runs; the system is made anew each time.
cache="${KRUSZARKA_DEBOOTSTRAP_CACHE:-/var/tmp/kruszarka-debootstrap-cache}"
mkdir -p "$cache"
root="$(mktemp -d /var/tmp/kruszarka-chroot.XXXXXX)"
# mktemp's folder is root's alone; the system inside is run by other users too.
chmod 755 "$root"
cleanup() {
  umount "$root/proc" 2> /dev/null || true
  rm -rf --one-file-system "$root"
}
trap cleanup EXIT
failures=0
fail() { echo "FAIL: $*" >&2; exit 1; }
# A failed check of the installed game is reported and the other checks still run.
flaw() { echo "FAIL: $*" >&2; failures=$((failures + 1)); }
in_root() { chroot "$root" env -i PATH=/usr/sbin:/usr/bin:/sbin:/bin HOME=/home/player "$@"; }

echo "== debootstrap bookworm (minbase) into $root"
debootstrap --variant=minbase --cache-dir="$cache" bookworm "$root" "$mirror" > "$root.log" 2>&1 ||
  { tail -20 "$root.log"; fail "debootstrap"; }
rm -f "$root.log"
# The game finds its data folder through /proc/self/exe.
mount -t proc proc "$root/proc"

echo "== apt-get install ./$(basename "$deb")"
cp "$deb" "$root/tmp/"
in_root apt-get update -qq
in_root env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends "/tmp/$(basename "$deb")" \
  > /dev/null
in_root dpkg-query -W -f='Depends: ${Depends}\n' kruszarka
in_root useradd --create-home player
as_player() { in_root setpriv --reuid=player --regid=player --init-groups env SDL_VIDEODRIVER=offscreen SDL_AUDIODRIVER=dummy "$@"; }

echo "== the menu entry's command, with --check-data"
desktop="$(ls "$root"/usr/share/applications/*.desktop)"
exec_line="$(sed -n 's/^Exec=//p' "$desktop")"
# shellcheck disable=SC2086 # the entry's command is words
as_player sh -c "cd / && $exec_line --check-data" || flaw "the installed game lacks the files named above"
[ -d "$root/home/player/.local/share/kruszarka" ] || flaw "no per-user folder"

echo "== the game itself, from the menu, for three seconds"
status=0
as_player sh -c "cd / && timeout 3 $exec_line" > "$root/tmp/game.out" 2>&1 || status=$?
cat "$root/tmp/game.out"
[ "$status" = 124 ] || flaw "the game stopped by itself (exit $status)"
if grep -q 'cannot draw\|no sound' "$root/tmp/game.out"; then flaw "the game reported missing files"; fi
[ "$failures" = 0 ] || fail "$failures checks of the installed game failed"
echo "== the installed game starts and finds its pictures, sounds and fonts"
