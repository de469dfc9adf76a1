#!/usr/bin/env bash
# Installs what is missing, builds everything into build/ and runs the whole test suite.
set -euo pipefail
here="$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)"
"$here/scripts/install-deps.sh"
cmake -S "$here" -B "$here/build" > /dev/null
cmake --build "$here/build" -j"$(nproc)"
ctest --test-dir "$here/build" --output-on-failure -j"$(nproc)"
