#!/usr/bin/env bash
# The run command: installs what is missing, builds, starts the simulator
# and the GUI pointed at it. Without a display it starts a virtual one and
# shares it over VNC on 127.0.0.1 only. Ctrl-C stops everything.
set -euo pipefail
here="$(cd "$(dirname "$0")/.." && pwd)"
"$here/scripts/deps.sh"
"$here/scripts/build.sh"
build="${MARIGOLD_BUILD_DIR:-$here/build}"

port="${MARIGOLD_PORT:-6300}"
export MARIGOLD_ROOT="$build/root"
export XDG_RUNTIME_DIR="${XDG_RUNTIME_DIR:-$build/xdg-runtime}"
mkdir -p "$XDG_RUNTIME_DIR"; chmod 700 "$XDG_RUNTIME_DIR"

pids=()
cleanup() {
  trap - INT TERM EXIT
  for p in "${pids[@]}"; do kill "$p" 2>/dev/null || true; done
  wait 2>/dev/null || true
  echo "stopped"
}
trap cleanup INT TERM EXIT

if [ -x "$build/bin/MeasurementServerSim" ]; then
  ctl=$((port + 1))
  "$build/bin/MeasurementServerSim" --port "$port" --control-port "$ctl" --data "$build/simdata" --no-stdin &
  pids+=($!)
  sleep 0.5
  echo "Simulator on 127.0.0.1:$port; drive it with: nc 127.0.0.1 $ctl  (type help; see MeasurementServerSim/README.md)"
else
  echo "(no simulator built yet: the GUI starts alone)"
fi

if [ -z "${DISPLAY:-}" ]; then
  display=":${MARIGOLD_DISPLAY:-42}"
  Xvfb "$display" -screen 0 320x480x24 -nolisten tcp >/dev/null 2>&1 &
  pids+=($!)
  for _ in $(seq 50); do [ -e "/tmp/.X11-unix/X${display#:}" ] && break; sleep 0.1; done
  export DISPLAY="$display"
  vncport="${MARIGOLD_VNC_PORT:-5900}"
  x11vnc -display "$display" -localhost -rfbport "$vncport" -forever -shared -nopw -quiet >/dev/null 2>&1 &
  pids+=($!)
  echo "Headless: the screen is shared over VNC at 127.0.0.1:$vncport (listening on loopback only)."
  echo "From another machine: ssh -L $vncport:127.0.0.1:$vncport <this host>, then a VNC viewer on localhost:$vncport."
fi

"$build/bin/GUIApplication" "127.0.0.1:$port" &
pids+=($!)
echo "GUIApplication running against 127.0.0.1:$port. Ctrl-C stops."
wait "${pids[-1]}"
