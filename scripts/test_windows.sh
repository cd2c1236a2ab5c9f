#!/usr/bin/env bash
# Cross-builds the whole program, its logic tests and its window tests for Windows with mingw-w64
# against a Qt for Windows (see scripts/windows_qt.sh) and runs the tests under Wine, without a
# display (the window tests with the offscreen platform plugin). Ends with the line
# "N passed, N failed"; fails if any test fails.
set -euo pipefail
cd "$(dirname "$0")/.."
. scripts/windows_qt.sh
build=build-windows
# Debug, as on Linux, keeps the asserts and builds in half the time of Release; mingw has no
# sanitizers. Qt's toolchain file finds Qt for Windows and hands the compilers to ours.
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=Debug -DSELECTOR_QT=ON \
  -DCMAKE_TOOLCHAIN_FILE="$windows_qt/lib/cmake/Qt6/qt.toolchain.cmake" \
  -DQT_CHAINLOAD_TOOLCHAIN_FILE="$PWD/cmake/mingw-w64.cmake"
cmake --build "$build" -j "$(nproc)" --target eawselector logic_tests window_tests stand_in_game

# Debian keeps the 64-bit loader out of PATH; the wineserver beside it stops with its last process.
wine="$(command -v wine64 || echo /usr/lib/wine/wine64)"
wineserver="$(dirname "$wine")/wineserver"

temp="$(mktemp -d)"
# The wineserver's socket folder goes to TMPDIR too, so removing $temp leaves nothing behind.
export WINEPREFIX="$temp/prefix" TMPDIR="$temp" WINELOADER="$wine" WINEDEBUG=-all
# No Mono or Gecko: the tests need neither, and making the prefix would offer to install them.
export WINEDLLOVERRIDES="mscoree,mshtml="
unset DISPLAY WAYLAND_DISPLAY
# Qt's DLLs and the compiler's, by their path on Wine's drive Z:, which is the root folder. The
# offscreen plugin draws text with the fonts the Linux tests use.
export WINEPATH="Z:${windows_qt//\//\\}\\bin"
export QT_QPA_FONTDIR='Z:\usr\share\fonts\truetype\liberation2'
export QT_QPA_PLATFORM=offscreen
trap '"$wineserver" -k 2>/dev/null || true; rm -rf "$temp"' EXIT

if ! timeout 300 "$wine" wineboot -i >"$temp/wineboot.log" 2>&1; then
  cat "$temp/wineboot.log" >&2
  echo "the Wine prefix could not be made" >&2
  exit 1
fi

passed=0
failed=0
# The system-locale tests once more where the ANSI code page is 1251 and the language Turkish.
runs=("$build/tests/logic_tests.exe" "$build/tests/window_tests.exe"
  "ru_RU.UTF-8 $build/tests/logic_tests.exe --gtest_filter=SystemLocale.*"
  "tr_TR.UTF-8 $build/tests/logic_tests.exe --gtest_filter=SystemLocale.*")
for run in "${runs[@]}"; do
  locale=en_US.UTF-8
  case "$run" in *_*.UTF-8\ *) locale="${run%% *}" run="${run#* }" ;; esac
  read -r exe filter <<<"$run"
  echo "== $exe ${filter:-} ($locale)"
  status=0
  # Each test program runs in one Wine process; its lines end in CR LF.
  LANG="$locale" LC_ALL="$locale" timeout 600 "$wine" "$exe" ${filter:-} --gtest_brief=1 \
    --gtest_color=no | tr -d '\r' | tee "$temp/out.txt" ||
    status=${PIPESTATUS[0]}
  ran="$(sed -n 's/^\[==========\] \([0-9]*\) tests\{0,1\} from .* ran\..*/\1/p' "$temp/out.txt")"
  ok="$(sed -n 's/^\[  PASSED  \] \([0-9]*\) tests\{0,1\}\..*/\1/p' "$temp/out.txt")"
  skipped="$(sed -n 's/^\[  SKIPPED \] \([0-9]*\) tests\{0,1\}\..*/\1/p' "$temp/out.txt")"
  if [ -z "$ran" ] || [ -z "$ok" ]; then
    # Stopped before its summary: counted as one failure, whatever it had passed.
    echo "$exe stopped before the end of its run (exit status $status)"
    failed=$((failed + 1))
    continue
  fi
  passed=$((passed + ok))
  failed=$((failed + ran - ok - ${skipped:-0}))
  if [ "$status" -ne 0 ] && [ "$ran" -eq "$((ok + ${skipped:-0}))" ]; then
    echo "$exe passed every test but ended with exit status $status"
    failed=$((failed + 1))
  fi
done

echo "$passed passed, $failed failed"
[ "$failed" -eq 0 ]
