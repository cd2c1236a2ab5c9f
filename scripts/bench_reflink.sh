#!/usr/bin/env bash
# Runs the clone test and the benchmark's load of big files on an XFS image with reflink, mounted
# from a loop device. Needs root and loop devices, and the test and benchmark builds (README);
# installs xfsprogs for itself when it is missing.
set -euo pipefail
cd "$(dirname "$0")/.."
pairs=${1:-9}
if [ "$(id -u)" -ne 0 ] || [ ! -e /dev/loop-control ]; then
  echo "load 20 x 50 MB, reflink file system: not run (needs root and loop devices)"
  exit 0
fi
command -v mkfs.xfs >/dev/null || DEBIAN_FRONTEND=noninteractive apt-get install -y xfsprogs
image=$(mktemp --tmpdir reflink-XXXXXX.img)
mountpoint=$(mktemp -d)
truncate -s 4G "$image"
mkfs.xfs -q -m reflink=1 "$image"
device=$(losetup --find --show "$image")
trap 'umount "$mountpoint"; losetup -d "$device"; rm -f "$image"; rmdir "$mountpoint"' EXIT
mount "$device" "$mountpoint"
SELECTOR_CLONE_FOLDER="$mountpoint" build-test/tests/logic_tests --gtest_filter='Places/CopyWays.*'
build-bench/bench/selector_bench "$pairs" clone "$mountpoint"
