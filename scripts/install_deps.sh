#!/usr/bin/env bash
# Installs the Debian packages the build, the tests (Linux and Windows under Wine) and the demo
# need; does nothing when all are there.
set -euo pipefail
packages=(cmake g++ make qt6-base-dev libgtest-dev xvfb xauth fonts-liberation2
  g++-mingw-w64-x86-64-posix wine64)
missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
done
if [ ${#missing[@]} -gt 0 ]; then
  sudo=""
  [ "$(id -u)" -eq 0 ] || sudo="sudo"
  $sudo apt-get update
  DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y "${missing[@]}"
fi
