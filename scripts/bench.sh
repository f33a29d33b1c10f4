#!/usr/bin/env bash
# Builds the release preset and runs the benchmarks. Extra arguments go to every benchmark program,
# e.g. scripts/bench.sh --benchmark_repetitions=10 --benchmark_report_aggregates_only=true
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/deps.sh
cmake --preset release >/dev/null
cmake --build --preset release
for b in build/release/bench/*_bench; do
  echo "== $(basename "$b")"
  "$b" "$@"
done
