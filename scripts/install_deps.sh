#!/usr/bin/env bash
# Installs the Debian packages that are missing; does nothing when all are there.
#   demo: what the program needs to be built and run (scripts/demo.sh)
#   test: that, and what the tests need: GoogleTest, a display for the screenshots, and the
#         Windows compiler and Wine for the Windows tests (scripts/test.sh)
set -euo pipefail
demo=(cmake g++ make qt6-base-dev fonts-liberation2)
# The Windows tests also build Qt for Windows from Debian's source (dpkg-dev, ninja-build), run
# the packaged program under Xvfb and drive it (xdotool), and pack it (zip, unzip).
test=(libgtest-dev xvfb xauth g++-mingw-w64-x86-64-posix wine64 locales xdotool dpkg-dev
  ninja-build zip unzip)
case "${1:-test}" in
demo) packages=("${demo[@]}") ;;
test) packages=("${demo[@]}" "${test[@]}") ;;
*)
  echo "usage: $0 demo|test" >&2
  exit 2
  ;;
esac
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
[ "${1:-test}" = test ] || exit 0
# Wine takes the system's language and ANSI code page from the Linux locale; the Windows tests
# run under these three.
for locale in en_US ru_RU tr_TR; do
  locale -a | grep -qx "$locale.utf8" || $sudo localedef -i "$locale" -f UTF-8 "$locale.UTF-8"
done
