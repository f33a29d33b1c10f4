#!/usr/bin/env bash
# Builds the libFuzzer targets with clang and runs each one for a while on a copy of its seed corpus.
# Usage: scripts/fuzz.sh [SECONDS_PER_TARGET]   (CI runs a few seconds each so the targets don't rot)
set -euo pipefail
cd "$(dirname "$0")/.."
seconds="${1:-5}"

scripts/deps.sh
cmake --preset fuzz >/dev/null
cmake --build --preset fuzz
shopt -s nullglob
for f in build/fuzz/fuzz/*_fuzz; do
  name=$(basename "$f")
  work=$(mktemp -d)
  echo "== $name for ${seconds}s"
  # New inputs go to the scratch folder first; the committed seeds are only read.
  "$f" -max_total_time="$seconds" -print_final_stats=1 "$work" "fuzz/corpus/${name%_fuzz}" 2>&1 | tail -n 4
  rm -rf "$work"
done
