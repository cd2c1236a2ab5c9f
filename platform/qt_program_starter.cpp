#include "platform/qt_program_starter.h"

#include "platform/qt_paths.h"

#include <QElapsedTimer>
#include <QProcess>
#include <QStandardPaths>

bool QtProgramStarter::StartDetached(const std::filesystem::path &program,
                                     [[maybe_unused]] bool windowsProgram) {
  // Not a detached start, so that its end can be heard. The process object is never deleted
  // while the program runs, since that would end the program; the program's output goes nowhere,
  // so that it cannot be stopped by a pipe nobody reads.
  auto *process = new QProcess;
  process->setProgram(FromPath(program));
#ifndef _WIN32
  const QString wine = QStandardPaths::findExecutable("wine");
  if (windowsProgram && !wine.isEmpty()) {
    process->setProgram(wine);
    process->setArguments({FromPath(program)});
  }
#endif
  process->setStandardInputFile(QProcess::nullDevice());
  process->setStandardOutputFile(QProcess::nullDevice());
  process->setStandardErrorFile(QProcess::nullDevice());
  process->start();
  if (!process->waitForStarted()) {
    delete process;
    return false;
  }
  QElapsedTimer running;
  running.start();
  QObject::connect(process, &QProcess::finished, &alive_,
                   [this, running, path = FromPath(program)](int code, QProcess::ExitStatus how) {
                     if (running.elapsed() >= kQuickExitMs || !told_ ||
                         (code == 0 && how == QProcess::NormalExit))
                       return;
                     told_(path, how == QProcess::CrashExit ? QString("it crashed")
                                                            : QString("status %1").arg(code));
                   });
  QObject::connect(process, &QProcess::finished, process, &QObject::deleteLater);
  return true;
}
