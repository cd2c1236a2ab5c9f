#pragma once

#include "base/program_starter.h"

#include <QObject>
#include <QString>
#include <functional>

// A program that ends this soon after its start with a non-zero status did not start properly.
inline constexpr int kQuickExitMs = 3000;

// Starts programs through Qt; outside Windows a Windows program through wine when it is
// installed. The program runs on independently, also after this program ends.
class QtProgramStarter : public ProgramStarter {
public:
  // `told` hears once of a started program that ends within kQuickExitMs with a non-zero status
  // (or crashes): its path and a text with the status.
  void OnQuickFailure(std::function<void(const QString &program, const QString &status)> told) {
    told_ = std::move(told);
  }
  bool StartDetached(const std::filesystem::path &program, bool windowsProgram) override;

private:
  std::function<void(const QString &, const QString &)> told_;
  QObject alive_; // ends the hearing when this starter goes
};
