#!/usr/bin/env bash
# Builds the program, makes a demo game folder in a temporary folder and saves a picture of each
# tab page of the window into docs/, on a virtual display.
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/install_deps.sh test
cmake -S . -B build-demo -DCMAKE_BUILD_TYPE=Release -DSELECTOR_TESTS=OFF
cmake --build build-demo -j "$(nproc)" --target make_demo_game take_screenshots
temp="$(mktemp -d)"
trap 'rm -rf "$temp"' EXIT
build-demo/make_demo_game "$temp/game"
mkdir -p docs
xvfb-run -a -s "-screen 0 1280x800x24" timeout 60 build-demo/take_screenshots "$temp/game" docs
