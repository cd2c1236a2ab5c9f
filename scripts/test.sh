#!/usr/bin/env bash
# Installs what is missing, builds with sanitizers and warnings as errors, runs every test headless,
# then cross-builds the logic tests for Windows and runs them under Wine.
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/install_deps.sh test
build=build-test
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=Debug -DSELECTOR_SANITIZE=ON
cmake --build "$build" -j "$(nproc)"
export QT_QPA_PLATFORM=offscreen
export ASAN_OPTIONS=detect_leaks=0
export UBSAN_OPTIONS=print_stacktrace=1
ctest --test-dir "$build" --output-on-failure -j "$(nproc)"
bash scripts/test_windows.sh
