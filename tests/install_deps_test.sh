#!/usr/bin/env bash
# The demo installs only what the program needs; the tests install that and the rest. Runs the
# script with stand-ins that find no package installed and print what would be installed.
set -euo pipefail
stubs=$(mktemp -d)
trap 'rm -rf "$stubs"' EXIT
printf '#!/bin/sh\nexit 1\n' >"$stubs/dpkg-query"
printf '#!/bin/sh\n[ "$1" = install ] && shift 2 && echo "$@"\nexit 0\n' >"$stubs/apt-get"
printf '#!/bin/sh\nexec "$@"\n' >"$stubs/sudo"
chmod +x "$stubs"/*
script="$(dirname "$0")/../scripts/install_deps.sh"
demo=$(PATH="$stubs:$PATH" bash "$script" demo)
test=$(PATH="$stubs:$PATH" bash "$script" test)
[ "$demo" = "cmake g++ make qt6-base-dev fonts-liberation2" ] || { echo "demo: $demo" && exit 1; }
for p in cmake qt6-base-dev libgtest-dev xvfb g++-mingw-w64-x86-64-posix wine64; do
  [[ " $test " == *" $p "* ]] || { echo "tests lack $p: $test" && exit 1; }
done
