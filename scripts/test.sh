#!/usr/bin/env bash
# Builds Kalmoret and runs every test. Usage: scripts/test.sh [dev|asan]
# Set KALMORET_WERROR=ON to turn warnings into errors (CI does).
set -euo pipefail
cd "$(dirname "$0")/.."
preset="${1:-dev}"

scripts/deps.sh
cmake --preset "$preset" >/dev/null
cmake --build --preset "$preset"
ctest --preset "$preset" -j "$(nproc)"
