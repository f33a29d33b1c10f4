#!/usr/bin/env bash
# The main job: builds the reference host Osrik.exe and the plug-in, installs both into a fresh
# host folder (build/sample) with the sample's settings file, runs the sample scenario there and
# prints the resulting project as JSON; the plan is drawn beside it as build/sample/plan.svg.
# Usage: scripts/run.sh [SAMPLE_FOLDER]   (default: samples/contour; it holds one *.scn and may
# hold the plug-in's settings file Kalmoret.ini)
set -euo pipefail
cd "$(dirname "$0")/.."
sample="${1:-samples/contour}"

scripts/deps.sh
cmake --preset dev >/dev/null
cmake --build --preset dev --target osrik kalmoret >/dev/null

host=build/sample
rm -rf "$host"
mkdir -p "$host/Standard/Makros"
cp build/dev/bin/Osrik.exe build/dev/bin/Kalmoret.* "$host/"
cp build/dev/bin/libKalmoretWin32.so "$host/" 2>/dev/null || true
if [ -f "$sample/Kalmoret.ini" ]; then
  cp "$sample/Kalmoret.ini" "$host/Standard/Makros/Kalmoret.ini"
fi
scenario=$(ls "$sample"/*.scn | head -n 1)
"$host/Osrik.exe" --svg "$host/plan.svg" "$scenario"
