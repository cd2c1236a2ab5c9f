#include "settings/game_start_qt.h"

#include "app/existence.h"
#include "app/names.h"
#include "ui/qt_paths.h"

#include <QProcess>
#include <QStandardPaths>

namespace fs = std::filesystem;

static bool StartDetached(const QString &program) {
#ifndef _WIN32
  const QString wine = QStandardPaths::findExecutable("wine");
  if (!wine.isEmpty())
    return QProcess::startDetached(wine, {program});
#endif
  return QProcess::startDetached(program, {});
}

std::string StartGame(const fs::path &eawDir) {
  const fs::path program = FindAnyCase(eawDir, "eaw.exe");
  FileCheck(program);
  if (!FileFound)
    return "The game cannot be started: " + DisplayPath(program) + " was not found.";
  if (!StartDetached(FromPath(program)))
    return "The game cannot be started: " + DisplayPath(program) + " could not be run.";
  return "";
}
