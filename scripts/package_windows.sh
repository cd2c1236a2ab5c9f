#!/usr/bin/env bash
# Builds the program for Windows (Release, against the Qt of scripts/windows_qt.sh) and makes
# eawselector-windows-x64.zip: the program, the DLLs and plugins it needs and a README.txt for
# players, to unpack into the game folder. Then tests the zip under Wine (scripts/smoke_test_windows.sh),
# which saves a picture of the screen to SCREENSHOT when it is given.
# Usage: package_windows.sh [SCREENSHOT.png]
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/install_deps.sh
. scripts/windows_qt.sh
build=build-windows-release
cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=Release -DSELECTOR_TESTS=OFF -DSELECTOR_QT=ON \
  -DCMAKE_TOOLCHAIN_FILE="$windows_qt/lib/cmake/Qt6/qt.toolchain.cmake" \
  -DQT_CHAINLOAD_TOOLCHAIN_FILE="$PWD/cmake/mingw-w64.cmake"
cmake --build "$build" -j "$(nproc)" --target eawselector

stage="$build/package"
rm -rf "$stage"
mkdir -p "$stage/platforms" "$stage/imageformats" "$stage/styles"
cp "$build/eawselector.exe" "$stage/"
for dll in Qt6Core Qt6Gui Qt6Widgets libstdc++-6 libgcc_s_seh-1 libwinpthread-1; do
  cp "$windows_qt/bin/$dll.dll" "$stage/"
done
# Qt finds its plugins in these folders beside the program: the window system, the picture
# formats of the previews (BMP is built in) and the native look of the controls.
cp "$windows_qt/plugins/platforms/qwindows.dll" "$stage/platforms/"
cp "$windows_qt/plugins/imageformats/"{qgif,qjpeg,qico}.dll "$stage/imageformats/"
cp "$windows_qt/plugins/styles/qwindowsvistastyle.dll" "$stage/styles/"
x86_64-w64-mingw32-strip "$stage"/*.exe "$stage"/*.dll "$stage"/*/*.dll
sed 's/$/\r/' scripts/windows_readme.txt >"$stage/README.txt"

zip="$PWD/eawselector-windows-x64.zip"
rm -f "$zip"
(cd "$stage" && zip -q -r -9 "$zip" .)
echo "made $zip ($(du -k "$zip" | cut -f1) KB)"
bash scripts/smoke_test_windows.sh "$zip" "${1:-}"
