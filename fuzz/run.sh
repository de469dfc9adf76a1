#!/usr/bin/env bash
# Builds the progress-file reader's fuzz target with clang's libFuzzer into build-fuzz/ and runs it for
# SECONDS (default 60). New inputs go to build-fuzz/corpus; the seeds in fuzz/corpus are only read.
set -euo pipefail
here="$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)"
seconds="${1:-60}"
out="$here/build-fuzz"
mkdir -p "$out/corpus"
clang++ -std=c++20 -O1 -g -fsanitize=fuzzer,address,undefined -fno-sanitize-recover=all \
  -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wsign-conversion -Wold-style-cast -Werror \
  -I"$here" "$here/fuzz/progress_fuzz.cpp" "$here/shell/progress_text.cpp" -o "$out/progress_fuzz"
"$out/progress_fuzz" -max_total_time="$seconds" -max_len=4096 -print_final_stats=1 \
  -artifact_prefix="$out/" "$out/corpus" "$here/fuzz/corpus"
