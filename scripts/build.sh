#!/usr/bin/env bash
# Configures (once) and builds the whole tree into ./build.
# Extra arguments are passed to the first cmake configure.
set -euo pipefail
here="$(cd "$(dirname "$0")/.." && pwd)"
build="${MARIGOLD_BUILD_DIR:-$here/build}"
if [ ! -f "$build/build.ninja" ]; then
  cmake -S "$here" -B "$build" -G Ninja -DCMAKE_BUILD_TYPE=RelWithDebInfo "$@"
fi
cmake --build "$build" -j"$(nproc)"
