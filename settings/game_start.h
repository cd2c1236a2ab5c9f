#pragma once

#include "base/failures.h"
#include "base/program_starter.h"

#include <filesystem>

// Whether `program` is a Windows program: its first bytes are "MZ".
bool IsWindowsProgram(const std::filesystem::path &program);
// Starts the game's eaw.exe in `eawDir` ("FLY") through `starter`. A missing program, or one
// that cannot be started, is recorded in `failures` with its path; true when it was started.
bool StartGame(const std::filesystem::path &eawDir, ProgramStarter &starter, Failures &failures);
