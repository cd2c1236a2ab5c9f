#pragma once

#include <filesystem>

// Starts programs for the core, which knows which program to start but not how the platform
// starts one.
class ProgramStarter {
public:
  virtual ~ProgramStarter() = default;
  // Starts `program` without arguments as an independent process; `windowsProgram` tells a
  // Windows program, which other systems run through a compatibility layer. False when it could
  // not be started.
  virtual bool StartDetached(const std::filesystem::path &program, bool windowsProgram) = 0;
};

// A starter for the core run headless, where no game is ever started: starts nothing.
class NoProgramStarter : public ProgramStarter {
public:
  bool StartDetached(const std::filesystem::path &, bool) override { return false; }
};
