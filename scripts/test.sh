#!/usr/bin/env bash
# The test command: installs what is missing, builds, runs every test.
#   scripts/test.sh [ctest arguments]
#   scripts/test.sh --sanitize [ctest arguments]   the same under AddressSanitizer
#                   and UndefinedBehaviorSanitizer, in its own build folder
#                   (build-asan, or MARIGOLD_BUILD_DIR)
set -euo pipefail
here="$(cd "$(dirname "$0")/.." && pwd)"
configure=()
if [ "${1:-}" = "--sanitize" ]; then
  shift
  export MARIGOLD_BUILD_DIR="${MARIGOLD_BUILD_DIR:-$here/build-asan}"
  configure=(-DMARIGOLD_SANITIZE=ON -DMARIGOLD_BUILD_BENCH=OFF)
  export ASAN_OPTIONS="fast_unwind_on_malloc=0"
  export LSAN_OPTIONS="suppressions=$here/scripts/lsan.supp:print_suppressions=0"
  export UBSAN_OPTIONS="print_stacktrace=1:halt_on_error=1"
fi
"$here/scripts/deps.sh"
start=$(date +%s)
"$here/scripts/build.sh" "${configure[@]}"
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
