# Sourced by the Windows scripts: sets windows_qt to a Qt for Windows (mingw-w64, DLLs).
# QT_WINDOWS_PREFIX when set; otherwise the cache folder outside the checkout, built there by
# scripts/build_qt_windows.sh on first use.
if [ -n "${QT_WINDOWS_PREFIX:-}" ]; then
  windows_qt="$QT_WINDOWS_PREFIX"
else
  qt_version="$(dpkg-query -W -f='${Version}' qt6-base-dev-tools)"
  qt_version="${qt_version%%+*}"
  windows_qt="${XDG_CACHE_HOME:-$HOME/.cache}/eawselector/qt-${qt_version%%-*}-mingw-w64"
  if ! [ -f "$windows_qt/eawselector-qt-build.txt" ]; then
    echo "Qt for Windows is not in $windows_qt yet: building it there first, which takes about" \
      "20 minutes on a 2-core machine (once)"
  fi
  bash "$(dirname "${BASH_SOURCE[0]}")/build_qt_windows.sh" "$windows_qt"
fi
if ! [ -f "$windows_qt/lib/cmake/Qt6/qt.toolchain.cmake" ]; then
  echo "$windows_qt holds no Qt for Windows (lib/cmake/Qt6/qt.toolchain.cmake)" >&2
  exit 1
fi
