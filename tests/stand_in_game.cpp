// The game for the window tests on Windows, copied into a game folder as eaw.exe: leaves a file
// "started-<process id>" beside itself, as the shell script that stands in for it elsewhere does,
// and ends with the status written in a file "exit-status" beside it, 0 without one.
#include <windows.h>

#include <filesystem>
#include <fstream>
#include <string>

int main() {
  std::wstring self(MAX_PATH, L'\0');
  self.resize(GetModuleFileNameW(nullptr, self.data(), static_cast<DWORD>(self.size())));
  const std::filesystem::path folder = std::filesystem::path(self).parent_path();
  // The status is read first: once the test sees the file, it may write another status.
  int status = 0;
  std::ifstream(folder / "exit-status") >> status;
  if (!std::ofstream(folder / ("started-" + std::to_string(GetCurrentProcessId()))))
    return 1;
  return status;
}
