#!/usr/bin/env bash
# Installs the build into a temporary prefix, moves it, and checks that the menu entry, its icons and metainfo
# are valid and in place, and that the installed game started from a foreign folder finds everything the
# build folder's game finds, and nothing lying in the folder it was started from.
# Usage: installed_tree_test.sh BUILD_DIR APP_ID
set -euo pipefail
build="$1"
id="$2"
tmp="$(mktemp -d)"
trap 'rm -rf "$tmp"' EXIT
fail() { echo "FAIL: $*" >&2; exit 1; }

cmake --install "$build" --prefix "$tmp/prefix" > /dev/null
# A moved prefix must still work: the game finds its data from its own folder.
mv "$tmp/prefix" "$tmp/moved"
prefix="$tmp/moved"
share="$prefix/share"

desktop="$share/applications/$id.desktop"
[ -f "$desktop" ] || fail "no menu entry $desktop"
desktop-file-validate "$desktop" || fail "invalid menu entry"
appstreamcli validate --no-net --pedantic "$share/metainfo/$id.metainfo.xml" > /dev/null ||
  fail "invalid metainfo: $(appstreamcli validate --no-net --pedantic "$share/metainfo/$id.metainfo.xml")"

icon="$(sed -n 's/^Icon=//p' "$desktop")"
[ -f "$share/icons/hicolor/scalable/apps/$icon.svg" ] || fail "no scalable icon $icon"
for size in 16 24 32 48 64 128 256; do
  png="$share/icons/hicolor/${size}x${size}/apps/$icon.png"
  [ -f "$png" ] || fail "no ${size}px icon"
  # The PNG header's width and height, big-endian, at bytes 16..23.
  read -r w h < <(od -An -tu1 -j16 -N8 "$png" | awk '{print $1*16777216+$2*65536+$3*256+$4, $5*16777216+$6*65536+$7*256+$8}')
  [ "$w $h" = "$size $size" ] || fail "the ${size}px icon is $w x $h"
done

exec_line="$(sed -n 's/^Exec=//p' "$desktop")"
program="${exec_line%% *}"
arguments="${exec_line#"$program"}"
[ -x "$prefix/bin/$program" ] || fail "the menu entry starts $program, which is not installed"
[ -x "$prefix/bin/kruszarka-script" ] || fail "no scenario runner"

# What the build folder's game finds is the measure of a complete install.
expected="$(cd "$tmp" && "$build/kruszarka" --check-data || true)"
if grep -q '^missing \(picture\|font\)' <<< "$expected"; then fail "the build itself lacks: $expected"; fi

# Started as the menu starts it: the per-user folder is made and becomes the working folder.
mkdir "$tmp/home"
# shellcheck disable=SC2086 # the entry's arguments are words
found="$(cd "$tmp/home" && XDG_DATA_HOME="$tmp/data" "$prefix/bin/$program" $arguments --check-data || true)"
[ "$found" = "$expected" ] || fail "the installed game finds less than the build's:
$found
--- the build's:
$expected"
[ -d "$tmp/data/kruszarka" ] || fail "no per-user folder made"
[ "$(stat -c %a "$tmp/data/kruszarka")" = 700 ] || fail "the per-user folder is open to others"

# A picture lying in the working folder is not the game's: with its installed copy gone it is missing.
rm "$share/kruszarka/assets/pictures/hero.svg"
mkdir -p "$tmp/home/assets/pictures"
cp "$build/assets/pictures/hero.svg" "$tmp/home/assets/pictures/"
status=0
found="$(cd "$tmp/home" && "$prefix/bin/kruszarka" --check-data 2> /dev/null)" || status=$?
[ "$status" = 1 ] || fail "a missing picture did not fail the check (exit $status)"
grep -qx 'missing picture: assets/pictures/hero.svg' <<< "$found" || fail "hero.svg was taken from the working folder"
echo "installed tree: complete"
