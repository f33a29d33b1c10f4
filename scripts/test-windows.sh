#!/usr/bin/env bash
# Builds Kalmoret.dll and Osrik.exe for Windows x86-64 with the mingw-w64 cross compiler (preset
# "windows", in build/windows) and runs the unit and scenario tests under Wine, headless.
# Usage: scripts/test-windows.sh [ctest arguments...]
# Set KALMORET_WERROR=ON to turn warnings into errors (CI does).
#
# Wine runs in a prefix of its own in a temporary folder, with the null graphics driver (windows
# without a display), a wine server kept up for the whole run and stopped at the end; every Wine
# call has a time limit.
set -euo pipefail
cd "$(dirname "$0")/.."

wine_loader=/usr/lib/wine/wine64
packages=(cmake ninja-build g++-mingw-w64-x86-64-posix binutils-mingw-w64-x86-64 wine64
          libgtest-dev libgmock-dev)
missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed' || missing+=("$p")
done
if [ ${#missing[@]} -gt 0 ]; then
  echo "Installing missing packages: ${missing[*]}"
  sudo=""
  [ "$(id -u)" -eq 0 ] || sudo="sudo"
  export DEBIAN_FRONTEND=noninteractive
  $sudo apt-get update -qq
  $sudo apt-get install -y -qq --no-install-recommends "${missing[@]}"
fi

export WINEPREFIX
WINEPREFIX="$(mktemp -d /tmp/kalmoret-wine.XXXXXX)"
export WINEDEBUG=-all
export WINEDLLOVERRIDES="mscoree,mshtml="  # no Mono or Gecko installer prompts in a new prefix
unset DISPLAY WAYLAND_DISPLAY
warmup_pid=""
cleanup() {
  [ -n "$warmup_pid" ] && kill "$warmup_pid" 2>/dev/null || true
  timeout 30 wineserver -k </dev/null >/dev/null 2>&1 || true
  timeout 30 wineserver -w </dev/null >/dev/null 2>&1 || true
  rm -rf "$WINEPREFIX"
}
trap cleanup EXIT

echo "== Windows build (mingw-w64)"
cmake --preset windows >/dev/null
cmake --build --preset windows -j "$(nproc)"

echo "== Wine prefix $WINEPREFIX"
# The null graphics driver must be in the registry before Wine first starts.
printf 'WINE REGISTRY Version 2\n\n[Software\\\\Wine\\\\Drivers]\n"Graphics"="null"\n' \
  >"$WINEPREFIX/user.reg"
# Wine's services must not inherit this script's pipes, or whoever reads them waits for ever.
timeout 300 "$wine_loader" wineboot -i </dev/null >/dev/null 2>&1
timeout 120 wineserver -w </dev/null >/dev/null 2>&1 || true
wineserver -p </dev/null >/dev/null 2>&1
# One long-lived process keeps the desktop up, so each test starts in a fraction of a second.
timeout 3600 "$wine_loader" notepad </dev/null >/dev/null 2>&1 &
warmup_pid=$!

echo "== Windows tests under Wine"
# Timers run on real time here: a case that checks a timer 10 ms before it falls due can fail when
# the machine is busy, so a failed case gets two more tries.
ctest --preset windows -j "$(nproc)" --timeout 120 --repeat until-pass:3 "$@"
