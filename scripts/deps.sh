#!/usr/bin/env bash
# Installs the Debian packages the build, the tests and the run need, only
# when some are missing. Uses sudo when not root.
set -euo pipefail

PACKAGES=(
  cmake ninja-build g++ ccache pkg-config
  qtbase5-dev qtbase5-dev-tools libqt5xmlpatterns5-dev libqt5svg5-dev
  qttools5-dev qttools5-dev-tools libqt5sql5-sqlite
  liblcms2-dev
  xvfb x11vnc xdotool imagemagick alsa-utils sox
  fonts-liberation fonts-roboto fonts-noto-cjk
  python3 uim-data m17n-db
)
if [ "${1:-}" = "--fuzz" ]; then
  PACKAGES+=(clang libclang-rt-14-dev)
fi

missing=()
for p in "${PACKAGES[@]}"; do
  if ! dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed"; then
    missing+=("$p")
  fi
done
[ ${#missing[@]} -eq 0 ] && exit 0

SUDO=""
if [ "$(id -u)" -ne 0 ]; then SUDO="sudo"; fi
echo "Installing: ${missing[*]}"
export DEBIAN_FRONTEND=noninteractive
$SUDO apt-get update -qq
$SUDO apt-get install -y -qq --no-install-recommends "${missing[@]}"
