#!/usr/bin/env bash
# Installs the Debian packages that are missing; does nothing when all are there.
#   demo: what the program needs to be built and run (scripts/demo.sh)
#   test: that, and what the tests need: GoogleTest, a display for the screenshots, and the
#         Windows compiler and Wine for the Windows tests (scripts/test.sh)
set -euo pipefail
demo=(cmake g++ make qt6-base-dev fonts-liberation2)
test=(libgtest-dev xvfb xauth g++-mingw-w64-x86-64-posix wine64)
case "${1:-test}" in
demo) packages=("${demo[@]}") ;;
test) packages=("${demo[@]}" "${test[@]}") ;;
*)
  echo "usage: $0 demo|test" >&2
  exit 2
  ;;
esac
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
