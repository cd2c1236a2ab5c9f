#!/usr/bin/env bash
# Usage: smoke_test_windows.sh ZIP [SCREENSHOT.png]
# Unpacks the players' zip into a demo game folder in a fresh Wine prefix and starts the program
# there with the "windows" platform plugin on a virtual screen (Xvfb). Then drives it as a player
# would, with the pointer: "World settings", a click on the add-on's row loads it, a second click
# unloads it, "Exit" ends the program. Fails unless the window comes up, the load puts the add-on's
# files into the game, the unload takes them out again and the program ends. With SCREENSHOT, saves
# the screen after the load.
set -euo pipefail
here="$(cd "$(dirname "$0")" && pwd)"

# Positions in the window, in pixels from its top left corner: the layout is fixed in twips.
world_tab=(170 14)    # the tab "World settings"
first_row=(420 80)    # the grid's first row, under its header
exit_button=(958 22) # "Exit", top right

wait_for() { # seconds, condition...
  local until=$((SECONDS + $1))
  shift
  until "$@"; do
    [ "$SECONDS" -lt "$until" ] || return 1
    sleep 0.5
  done
}

drive() { # game folder, screenshot file or ""
  local game="$1" screenshot="$2" window
  timeout 300 "$WINELOADER" wineboot -i >/dev/null 2>&1
  (cd "$game" && exec "$WINELOADER" "$game/eawselector.exe") &
  local program=$!
  if ! window="$(timeout 120 xdotool search --sync --onlyvisible --name '^ZEP for 150' | head -1)" ||
    [ -z "$window" ]; then
    echo "FAIL: the window did not come up" >&2
    return 1
  fi
  echo "the window is up: $(xdotool getwindowname "$window" | cut -c1-40)..."
  sleep 2
  click() { xdotool mousemove --window "$window" "$1" "$2" click 1; }
  click "${world_tab[@]}"
  sleep 1
  click "${first_row[@]}"
  if ! wait_for 30 test -f "$game/demoskin.dat" -a -f "$game/Savedata/demo.msn"; then
    [ -z "$screenshot" ] || import -window "$window" "$screenshot"
    echo "FAIL: a click on the add-on's row did not load it" >&2
    return 1
  fi
  echo "loaded: $(cd "$game" && ls demoskin.dat Savedata/demo.msn | tr '\n' ' ')"
  sleep 1
  [ -z "$screenshot" ] || import -window "$window" "$screenshot"
  click "${first_row[@]}"
  if ! wait_for 30 test ! -e "$game/demoskin.dat" -a ! -e "$game/Savedata/demo.msn"; then
    echo "FAIL: a second click did not unload it" >&2
    return 1
  fi
  echo "unloaded: the add-on's files are gone from the game"
  click "${exit_button[@]}"
  if ! wait_for 30 bash -c "! kill -0 $program 2>/dev/null"; then
    echo "FAIL: \"Exit\" did not end the program" >&2
    return 1
  fi
  echo "ended by \"Exit\""
}

if [ "${1:-}" = "--drive" ]; then
  drive "$2" "${3:-}"
  exit
fi

zip="$(realpath "$1")"
screenshot="${2:+$(realpath -m "$2")}"
wine="$(command -v wine64 || echo /usr/lib/wine/wine64)"
temp="$(mktemp -d)"
export WINEPREFIX="$temp/prefix" TMPDIR="$temp" WINELOADER="$wine" WINEDEBUG=-all
export WINEDLLOVERRIDES="mscoree,mshtml="
trap '"$(dirname "$wine")/wineserver" -k 2>/dev/null || true; rm -rf "$temp"' EXIT

# A demo game: the game's folders and files, and one add-on with a game file and a mission.
game="$temp/game"
mkdir -p "$game/Savedata" "$game/Music" "$game/ZEP128/S-Demo skins"
printf 'MZ' >"$game/eaw.exe"
printf '[Screen]\r\nWidth=800\r\nHeight=600\r\n' >"$game/eaw.ini"
printf 'skin\r\n' >"$game/ZEP128/S-Demo skins/demoskin.dat"
printf 'mission\r\n' >"$game/ZEP128/S-Demo skins/demo.msn"
unzip -q "$zip" -d "$game"

xvfb-run -a -s "-screen 0 1280x1024x24" bash "$here/smoke_test_windows.sh" --drive "$game" \
  "$screenshot"
echo "the Windows package passed its smoke test"
