#!/usr/bin/env bash
# Kills loads, unloads, Reset All and music switches at random moments, lets the next start
# finish or roll back what was interrupted, and checks that no player's file was lost, no file
# is half written, no temporary file is left and the record agrees with the game folder.
# Prints how many kills it tried and how many left damage; fails when any did.
# Usage: bash scripts/kill_test.sh [kills]   (not part of the test run: it takes minutes)
set -euo pipefail
cd "$(dirname "$0")/.."
kills="${1:-200}"
cmake -S . -B build-kill -DCMAKE_BUILD_TYPE=Release -DSELECTOR_TESTS=OFF -DSELECTOR_QT=OFF >/dev/null
cmake --build build-kill -j "$(nproc)" --target crash_driver >/dev/null
driver="$PWD/build-kill/crash_driver"
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT
game="$work/game"

# Writes `count` files named `stem`N.`extension` of `size` random bytes into `folder`.
make_files() {
  local folder="$1" stem="$2" extension="$3" count="$4" size="$5"
  mkdir -p "$folder"
  for ((n = 0; n < count; n++)); do
    head -c "$size" /dev/urandom >"$folder/$stem$n.$extension"
  done
}

mkdir -p "$game/Savedata" "$game/Music" "$game/Set1" "$game/Set2" "$game/ZEP128"
printf 'Flight models: F\r\nSounds: N\r\nCampaigns: C\r\n' >"$game/ZEP128/zep.ini"
printf 'Set1\r\nSet2\r\nSet3\r\n' >"$game/Music.ini"
make_files "$game/ZEP128/F-Big" part dat 1000 4096
make_files "$game/ZEP128/F-Big" big ter 3 30000000
make_files "$game/ZEP128/N-A" sound wav 40 8192
make_files "$game/ZEP128/N-B" sound wav 30 8192
make_files "$game/ZEP128/C-War" war msn 20 2048
head -c 5000 /dev/urandom >"$game/ZEP128/F-Big/game.cfg"
head -c 5000 /dev/urandom >"$game/ZEP128/F-Big/mission.msn"
# The player's own files, two of which F-Big replaces.
head -c 7000 /dev/urandom >"$game/game.cfg"
head -c 7000 /dev/urandom >"$game/eaw.exe"
head -c 3000 /dev/urandom >"$game/Savedata/mission.msn"
head -c 3000 /dev/urandom >"$game/Savedata/pilot.sve"
for set in Music Set1 Set2; do head -c 3000 /dev/urandom >"$game/$set/$set.bgm"; done
"$driver" "$game" start
"$driver" "$game" manifest "$work/manifest"

steps=("click F-Big" "click F-Big" "click N-A" "click N-B" "click C-War" "reset" "music")
damaged=0
halfway=0
for ((kill = 1; kill <= kills; kill++)); do
  step="${steps[RANDOM % ${#steps[@]}]}"
  # shellcheck disable=SC2086
  "$driver" "$game" $step 2>/dev/null &
  pid=$!
  sleep "0.$(printf "%03d" $((RANDOM % 150)))"
  kill -9 "$pid" 2>/dev/null || true
  wait "$pid" 2>/dev/null || true
  if [ -e "$game/ZEP128/#Selector/journal.txt" ] || [ -e "$game/ZEP128/#Selector/music.txt" ] ||
    [ -n "$(find "$game" -name '*.partial' -print -quit)" ]; then
    halfway=$((halfway + 1))
  fi
  "$driver" "$game" start 2>/dev/null
  if ! "$driver" "$game" check "$work/manifest" >"$work/damage"; then
    damaged=$((damaged + 1))
    echo "kill $kill during \"$step\" left damage:"
    cat "$work/damage"
  fi
done
echo "$kills kills, $halfway of them in the middle of an operation, $damaged left damage"
[ "$damaged" -eq 0 ]
