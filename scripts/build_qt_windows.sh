#!/usr/bin/env bash
# Usage: build_qt_windows.sh PREFIX
# Cross-builds Qt's qtbase for 64-bit Windows (DLLs) from Debian's own source package with mingw-w64
# and installs it into PREFIX: Core, Gui, Widgets and Test, the "windows" and "offscreen" platform
# plugins, Qt's bundled third-party libraries only. Debian's Qt host tools (moc, rcc, uic) do the
# code generation, so their version must be the source's. Takes about 20 minutes on a quiet 2-core
# machine (43 CPU-minutes). Does nothing when PREFIX already holds this build.
set -euo pipefail
[ $# -eq 1 ] || {
  echo "usage: $0 PREFIX" >&2
  exit 2
}
here="$(cd "$(dirname "$0")/.." && pwd)"
prefix="$(realpath -m "$1")"
jobs="${JOBS:-2}"

host_version="$(dpkg-query -W -f='${Version}' qt6-base-dev-tools 2>/dev/null || true)"
[ -n "$host_version" ] || {
  echo "Debian's Qt host tools (qt6-base-dev-tools) are not installed" >&2
  exit 1
}
upstream="${host_version%%+*}"
upstream="${upstream%%-*}"
# What was asked of the build; a change here rebuilds.
options=(
  -DBUILD_SHARED_LIBS=ON -DCMAKE_BUILD_TYPE=Release
  -DQT_BUILD_EXAMPLES=OFF -DQT_BUILD_TESTS=OFF -DQT_BUILD_BENCHMARKS=OFF
  -DFEATURE_sql=OFF -DFEATURE_network=OFF -DFEATURE_dbus=OFF -DFEATURE_printsupport=OFF
  -DFEATURE_concurrent=OFF -DFEATURE_xml=OFF -DFEATURE_opengl=OFF -DINPUT_opengl=no
  -DFEATURE_vulkan=OFF -DFEATURE_zstd=OFF
  -DFEATURE_testlib=ON -DFEATURE_widgets=ON -DFEATURE_freetype=ON -DFEATURE_harfbuzz=ON
  -DFEATURE_system_zlib=OFF -DFEATURE_system_pcre2=OFF -DFEATURE_system_freetype=OFF
  -DFEATURE_system_harfbuzz=OFF -DFEATURE_system_libpng=OFF -DFEATURE_system_doubleconversion=OFF
  -DFEATURE_system_md4c=OFF -DFEATURE_system_jpeg=OFF -DFEATURE_jpeg=ON -DFEATURE_gif=ON
  # The windows plugin uses the DirectWrite 3 font database whenever the compiler has its header,
  # but Gui builds it only with Direct2D: with Direct2D off, DirectWrite 3 must be off as well.
  -DFEATURE_direct2d=OFF -DFEATURE_directwrite3=OFF
  # Debian's source leaves out the tablet library (src/3rdparty/wintab).
  -DFEATURE_tabletevent=OFF
)
stamp_text="qtbase $upstream mingw-w64 x86_64 ${options[*]}"
stamp="$prefix/eawselector-qt-build.txt"
if [ -f "$stamp" ] && [ "$(cat "$stamp")" = "$stamp_text" ]; then
  echo "Qt $upstream for Windows is already built in $prefix"
  exit 0
fi

echo "Building Qt $upstream for Windows into $prefix: this takes about 20 minutes on 2 cores"
work="$prefix.work"
mkdir -p "$work"
cd "$work"

if ! ls qt6-base_*.dsc >/dev/null 2>&1; then
  if ! grep -rqs "^Types:.*deb-src" /etc/apt/sources.list.d/ &&
    ! grep -qs "^deb-src" /etc/apt/sources.list; then
    suite="$(. /etc/os-release && echo "$VERSION_CODENAME")"
    sudo=""
    [ "$(id -u)" -eq 0 ] || sudo="sudo"
    printf 'Types: deb-src\nURIs: http://deb.debian.org/debian\nSuites: %s\nComponents: main\nSigned-By: /usr/share/keyrings/debian-archive-keyring.gpg\n' \
      "$suite" | $sudo tee /etc/apt/sources.list.d/eawselector-src.sources >/dev/null
    $sudo apt-get update
  fi
  apt-get source --download-only "qt6-base=$host_version"
fi
source_version="$(sed -n 's/^Version: //p' qt6-base_*.dsc | head -1)"
if [ "$source_version" != "$host_version" ]; then
  echo "the source is qt6-base $source_version but the host tools are $host_version" >&2
  exit 1
fi
if [ ! -f src/CMakeLists.txt ]; then
  rm -rf src
  dpkg-source -x qt6-base_*.dsc src
fi

# Qt's DLLs link the compiler's runtime as DLLs, as Qt's own MinGW builds do.
cat >toolchain.cmake <<EOF
include("$here/cmake/mingw-w64.cmake")
set(CMAKE_EXE_LINKER_FLAGS_INIT "")
EOF
cmake -S src -B build -G Ninja -Wno-dev \
  -DCMAKE_TOOLCHAIN_FILE="$work/toolchain.cmake" -DCMAKE_INSTALL_PREFIX="$prefix" \
  -DQT_HOST_PATH=/usr -DQT_HOST_PATH_CMAKE_DIR=/usr/lib/x86_64-linux-gnu/cmake \
  "${options[@]}"
cmake --build build -j "$jobs"
cmake --install build

# The compiler's runtime DLLs beside Qt's, so PREFIX/bin is everything a program needs.
for dll in libstdc++-6.dll libgcc_s_seh-1.dll libwinpthread-1.dll; do
  cp "$(x86_64-w64-mingw32-g++-posix -print-file-name="$dll")" "$prefix/bin/"
done
for plugin in platforms/qwindows.dll platforms/qoffscreen.dll; do
  [ -f "$prefix/plugins/$plugin" ] || {
    echo "the build has no $plugin" >&2
    exit 1
  }
done
echo "$stamp_text" >"$stamp"
echo "Qt $upstream for Windows is built in $prefix"
