#!/usr/bin/env bash
# Installs what is missing, builds into build/ and starts the game in the current folder
# (where config.cfg is read and written).
set -euo pipefail
here="$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)"
"$here/scripts/install-deps.sh"
cmake -S "$here" -B "$here/build" > /dev/null
cmake --build "$here/build" -j"$(nproc)" --target kruszarka
exec "$here/build/kruszarka"
