#include "settings/game_start.h"

#include "base/existence.h"
#include "base/names.h"

#include <fstream>

namespace fs = std::filesystem;

bool IsWindowsProgram(const fs::path &program) {
  std::ifstream in(program, std::ios::binary);
  char magic[2] = {};
  return in.read(magic, sizeof magic) && magic[0] == 'M' && magic[1] == 'Z';
}

bool StartGame(const fs::path &eawDir, ProgramStarter &starter, Failures &failures) {
  const fs::path program = FindAnyCase(eawDir, "eaw.exe");
  if (!FileCheck(program)) {
    failures.Add(DisplayPath(program) + " was not found.");
    return false;
  }
  if (!starter.StartDetached(program, IsWindowsProgram(program))) {
    failures.Add(DisplayPath(program) + " could not be run.");
    return false;
  }
  return true;
}
