#!/usr/bin/env bash
# The test command: installs what is missing, builds, runs every test.
set -euo pipefail
here="$(cd "$(dirname "$0")/.." && pwd)"
"$here/scripts/deps.sh"
start=$(date +%s)
"$here/scripts/build.sh"
build="${MARIGOLD_BUILD_DIR:-$here/build}"
built=$(date +%s)
cd "$build"
export QT_QPA_PLATFORM=offscreen
export XDG_RUNTIME_DIR="$build/xdg-runtime"
mkdir -p "$XDG_RUNTIME_DIR"; chmod 700 "$XDG_RUNTIME_DIR"
set +e
ctest --output-on-failure -j"$(nproc)" "$@"
rc=$?
set -e
end=$(date +%s)
echo "build: $((built - start)) s, tests: $((end - built)) s"
exit $rc
