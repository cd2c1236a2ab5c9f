#!/usr/bin/env bash
# Installs what is missing, builds, makes a demo game folder and starts the program in it.
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/install_deps.sh demo
cmake -S . -B build-demo -DCMAKE_BUILD_TYPE=Release -DSELECTOR_TESTS=OFF
cmake --build build-demo -j "$(nproc)" --target eawselector make_demo_game
game="${1:-$PWD/demo-game}"
build-demo/make_demo_game "$game"
cp build-demo/eawselector "$game/"
exec "$game/eawselector"
