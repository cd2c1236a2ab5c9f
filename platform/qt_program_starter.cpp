#include "platform/qt_program_starter.h"

#include "platform/qt_paths.h"

#include <QProcess>
#include <QStandardPaths>

bool QtProgramStarter::StartDetached(const std::filesystem::path &program,
                                     [[maybe_unused]] bool windowsProgram) {
#ifndef _WIN32
  const QString wine = QStandardPaths::findExecutable("wine");
  if (windowsProgram && !wine.isEmpty())
    return QProcess::startDetached(wine, {FromPath(program)});
#endif
  return QProcess::startDetached(FromPath(program), {});
}
