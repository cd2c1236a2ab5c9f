#pragma once

#include "base/program_starter.h"

// Starts programs through Qt; outside Windows a Windows program through wine when it is
// installed.
class QtProgramStarter : public ProgramStarter {
public:
  bool StartDetached(const std::filesystem::path &program, bool windowsProgram) override;
};
