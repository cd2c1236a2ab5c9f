#!/usr/bin/env bash
# Cross-builds the plain C++ core and its logic tests for Windows with mingw-w64 and runs them under
# Wine, without a display. Ends with the line "N passed, N failed"; fails if any test fails.
set -euo pipefail
cd "$(dirname "$0")/.."
build=build-win
# Debug, as on Linux, keeps the asserts and builds in half the time of Release; mingw has no
# sanitizers.
cmake -S . -B "$build" -DCMAKE_TOOLCHAIN_FILE=cmake/mingw-w64.cmake -DCMAKE_BUILD_TYPE=Debug
cmake --build "$build" -j "$(nproc)"

# Debian keeps the 64-bit loader out of PATH; the wineserver beside it stops with its last process.
wine="$(command -v wine64 || echo /usr/lib/wine/wine64)"
wineserver="$(dirname "$wine")/wineserver"

temp="$(mktemp -d)"
# The wineserver's socket folder goes to TMPDIR too, so removing $temp leaves nothing behind.
export WINEPREFIX="$temp/prefix" TMPDIR="$temp" WINELOADER="$wine" WINEDEBUG=-all
# No Mono or Gecko: the tests need neither, and making the prefix would offer to install them.
export WINEDLLOVERRIDES="mscoree,mshtml="
unset DISPLAY WAYLAND_DISPLAY
trap '"$wineserver" -k 2>/dev/null || true; rm -rf "$temp"' EXIT

if ! timeout 300 "$wine" wineboot -i >"$temp/wineboot.log" 2>&1; then
  cat "$temp/wineboot.log" >&2
  echo "the Wine prefix could not be made" >&2
  exit 1
fi

passed=0
failed=0
for exe in "$build"/tests/*.exe; do
  echo "== $exe"
  status=0
  # Each test program runs in one Wine process; its lines end in CR LF.
  timeout 300 "$wine" "$exe" --gtest_brief=1 --gtest_color=no | tr -d '\r' | tee "$temp/out.txt" ||
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
