#!/usr/bin/env bash
# Renders the plug-in's toolbar bitmaps and each message box it shows to PNG files, for the README
# and for review (not part of CI). The message boxes come from the Windows build under Wine with its
# X11 driver on a virtual screen (xvfb-run); imagemagick's import takes each box while the host
# driver keeps it up (OSRIK_MESSAGE_BOX_PAUSE_MS).
# Usage: scripts/screenshots.sh [OUTPUT_FOLDER]   (default: build/screenshots)
set -euo pipefail
cd "$(dirname "$0")/.."
wine_loader=/usr/lib/wine/wine64

if [ "${1:-}" = "--on-screen" ]; then
  # Inside xvfb-run: $2 the output folder, then pairs of host folder and scenario.
  out="$2"
  shift 2
  n=0
  while [ $# -ge 2 ]; do
    host="$1" scenario="$2"
    shift 2
    OSRIK_MESSAGE_BOX_PAUSE_MS=2500 timeout 120 "$wine_loader" "$host/Osrik.exe" \
      --out "$host/project.json" "$scenario" </dev/null >/dev/null 2>&1 &
    pid=$!
    seen=""
    while kill -0 "$pid" 2>/dev/null; do
      # A box is a top-level window captioned with the plug-in's name.
      id=$(xwininfo -root -children 2>/dev/null | awk '/"Kalmoret"/ {print $1; exit}')
      if [ -n "$id" ] && [ "$id" != "$seen" ]; then
        sleep 0.5  # let it paint
        n=$((n + 1))
        import -window "$id" "$out/message-$n.png" 2>/dev/null || true
        seen="$id"
      fi
      sleep 0.2
    done
    wait "$pid" || true
  done
  exit 0
fi

out="$(realpath -m "${1:-build/screenshots}")"
packages=(xvfb xauth imagemagick x11-utils)
missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed' || missing+=("$p")
done
if [ ${#missing[@]} -gt 0 ]; then
  sudo=""
  [ "$(id -u)" -eq 0 ] || sudo="sudo"
  DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y -qq --no-install-recommends "${missing[@]}"
fi

mkdir -p "$out"
echo "== toolbar bitmaps"
for bmp in res/*.bmp; do
  name=$(basename "$bmp" .bmp)
  convert "$bmp" -scale 800% "$out/toolbar-$name.png"
done

echo "== Windows build"
cmake --preset windows >/dev/null
cmake --build --preset windows --target osrik kalmoret

export WINEPREFIX
WINEPREFIX="$(mktemp -d /tmp/kalmoret-shots.XXXXXX)"
export WINEDEBUG=-all WINEDLLOVERRIDES="mscoree,mshtml="
work="$(mktemp -d /tmp/kalmoret-shots-host.XXXXXX)"
cleanup() {
  timeout 30 wineserver -k </dev/null >/dev/null 2>&1 || true
  rm -rf "$WINEPREFIX" "$work"
}
trap cleanup EXIT
# Xvfb has no window manager: Wine draws the captions itself.
printf 'WINE REGISTRY Version 2\n\n[Software\\\\Wine\\\\X11 Driver]\n"Decorated"="N"\n' \
  >"$WINEPREFIX/user.reg"

# Scenarios that bring up each message box: the end request, and the question before converting a
# contour line.
cat >"$work/end.scn" <<'EOF'
ui cancel
button toolbar 3
EOF
cat >"$work/convert.scn" <<'EOF'
button polyline 2
click polyline 1 1
ui cancel
button polyline 4
EOF
args=()
for scenario in end convert; do
  host="$work/$scenario"
  mkdir -p "$host/Standard/Makros"
  cp build/windows/bin/Osrik.exe build/windows/bin/Kalmoret.dll "$host/"
  args+=("$host" "$work/$scenario.scn")
done

echo "== message boxes"
xvfb-run -a -s "-screen 0 1024x768x24" timeout 600 \
  env WINEPREFIX="$WINEPREFIX" bash -c \
  'timeout 300 '"$wine_loader"' wineboot -i </dev/null >/dev/null 2>&1; exec "$0" "$@"' \
  "$0" --on-screen "$out" "${args[@]}"
ls -1 "$out"
