#!/usr/bin/env bash
# The deterministic kill test: kills each operation at its N-th call of each file-changing system
# call, for every N (strace injects the kill), lets the next start finish or roll back what was
# interrupted, and checks the game folder: no player's file lost or changed, none half written,
# no temporary file, no add-on copy left outside the ledger, record and ledger agree. Then the
# same with a second kill at each call of the recovery. Prints the counts per operation and
# fails when any state was damaged.
# Usage: bash scripts/kill_sweep.sh [--no-second]   (not part of the test run: it takes minutes)
set -euo pipefail
cd "$(dirname "$0")/.."
second=1
[ "${1:-}" = "--no-second" ] && second=0
if ! command -v strace >/dev/null; then
  # Another apt-get may hold the lock: try again for a while.
  for _ in $(seq 30); do
    sudo=""
    [ "$(id -u)" -ne 0 ] && sudo=sudo
    $sudo apt-get install -y strace >/dev/null 2>&1 && break
    sleep 10
  done
fi
cmake -S . -B build-kill -DCMAKE_BUILD_TYPE=Release -DSELECTOR_TESTS=OFF -DSELECTOR_QT=OFF >/dev/null
cmake --build build-kill -j 2 --target crash_driver >/dev/null
driver="$PWD/build-kill/crash_driver"
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT
template="$work/template"
game="$work/game"
# Each call is swept on its own, so that N counts the calls of that one.
calls=(rename renameat renameat2 unlink unlinkat write sendfile copy_file_range mkdir fchmodat)

random_file() { head -c "${2:-3000}" /dev/urandom >"$1"; }

mkdir -p "$template/Savedata" "$template/Music" "$template/Set1" "$template/ZEP128"
printf 'Sounds: N\r\nSkins: S\r\nCampaigns: C\r\n' >"$template/ZEP128/zep.ini"
printf 'Set0\r\nSet1\r\n' >"$template/Music.ini"
printf '[Main]\r\nWidth=800\r\n' >"$template/eaw.ini"
mkdir -p "$template"/ZEP128/{N-A,N-B,S-X,S-Y,C-War}
for file in N-A/game.cfg N-A/mission.msn N-A/a1.dat N-A/sky.spt N-B/sky.spt N-B/b1.dat \
  S-X/x.dat S-X/game.cfg S-Y/y.dat S-Y/game.cfg C-War/war.msn; do
  random_file "$template/ZEP128/$file"
done
# The player's own files, some of which the folders replace.
for file in game.cfg eaw.exe Savedata/mission.msn Savedata/pilot.sve Music/Music.bgm \
  Set1/Set1.bgm; do
  random_file "$template/$file" 7000
done
"$driver" "$template" start
"$driver" "$template" ini
"$driver" "$template" manifest "$work/manifest"

# name | clicks before | the operation
operations=(
  "load keeping originals||click N-A"
  "load over the other folder of a one-per-category letter|click S-X|click S-Y"
  "unload putting originals back|click N-A|click N-A"
  "unload of a shared file|click N-A;click N-B|click N-A"
  "Reset All|click N-A;click N-B;click S-X;click C-War|reset"
  "music switch||music"
  "eaw.ini save||ini"
)

# Kills `driver $game $step` at call number $n of $call; false when it ran to its end first.
killed_at() {
  local call="$1" n="$2"
  shift 2
  # In a subshell, so that the shell does not announce each kill.
  ! (strace -f -qq -o /dev/null -e trace="$call" -e inject="$call:signal=KILL:when=$n" \
    "$driver" "$game" "$@"
    exit $?) >/dev/null 2>&1
}

# Starts the program (the recovery) and checks; counts and prints damage.
recover_and_check() {
  "$driver" "$game" start >/dev/null 2>&1
  if ! "$driver" "$game" check "$work/manifest" >"$work/damage"; then
    damaged=$((damaged + 1))
    echo "  damage after $1:"
    sed 's/^/    /' "$work/damage"
  fi
}

total_kills=0
total_second=0
total_damaged=0
for operation in "${operations[@]}"; do
  IFS='|' read -r name before step <<<"$operation"
  rm -rf "$work/prepared"
  cp -a "$template" "$work/prepared"
  IFS=';' read -ra clicks <<<"$before"
  for click in "${clicks[@]}"; do
    # shellcheck disable=SC2086
    "$driver" "$work/prepared" $click >/dev/null 2>&1
  done
  kills=0
  second_kills=0
  damaged=0
  for call in "${calls[@]}"; do
    for ((n = 1; ; n++)); do
      rm -rf "$game"
      cp -a "$work/prepared" "$game"
      # shellcheck disable=SC2086
      killed_at "$call" "$n" $step || break
      kills=$((kills + 1))
      rm -rf "$work/killed"
      cp -a "$game" "$work/killed"
      recover_and_check "a kill at $call #$n"
      [ "$second" -eq 1 ] || continue
      for call2 in "${calls[@]}"; do
        for ((m = 1; ; m++)); do
          rm -rf "$game"
          cp -a "$work/killed" "$game"
          killed_at "$call2" "$m" start || break
          second_kills=$((second_kills + 1))
          recover_and_check "a kill at $call #$n, then in the recovery at $call2 #$m"
        done
      done
    done
  done
  echo "$name: $kills kills, $second_kills second kills in the recovery, $damaged damaged"
  total_kills=$((total_kills + kills))
  total_second=$((total_second + second_kills))
  total_damaged=$((total_damaged + damaged))
done
echo "all: $total_kills kills, $total_second second kills in the recovery, $total_damaged damaged"
[ "$total_damaged" -eq 0 ]
