#!/usr/bin/env bash
# Installs the Debian packages the build, the tests (Linux and Windows under Wine) and the demo
# need; does nothing when all are there.
set -euo pipefail
packages=(cmake g++ make qt6-base-dev libgtest-dev xvfb xauth fonts-liberation2
  g++-mingw-w64-x86-64-posix wine64 locales xdotool dpkg-dev ninja-build zip unzip)
sudo=""
[ "$(id -u)" -eq 0 ] || sudo="sudo"
missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
done
if [ ${#missing[@]} -gt 0 ]; then
  $sudo apt-get update
  DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y "${missing[@]}"
fi
# Wine takes the system's language and ANSI code page from the Linux locale; the Windows tests
# run under these three.
for locale in en_US ru_RU tr_TR; do
  locale -a | grep -qx "$locale.utf8" || $sudo localedef -i "$locale" -f UTF-8 "$locale.UTF-8"
done
