#!/usr/bin/env bash
# Configures (once) and builds the whole tree into ./build.
# Extra arguments are passed to the first cmake configure.
set -euo pipefail
here="$(cd "$(dirname "$0")/.." && pwd)"
build="${MARIGOLD_BUILD_DIR:-$here/build}"
# Let clones in other folders share the compiler cache.
export CCACHE_BASEDIR="${CCACHE_BASEDIR:-$here}"
export CCACHE_NOHASHDIR="${CCACHE_NOHASHDIR:-1}"
if [ ! -f "$build/build.ninja" ]; then
  cmake -S "$here" -B "$build" -G Ninja -DCMAKE_BUILD_TYPE=RelWithDebInfo "$@"
fi
cmake --build "$build" -j"$(nproc)"
