// The game for the window tests on Windows, copied into a game folder as eaw.exe: leaves a file
// "started-<process id>" beside itself, as the shell script that stands in for it elsewhere does.
#include <windows.h>

#include <filesystem>
#include <fstream>
#include <string>

int main() {
  std::wstring self(MAX_PATH, L'\0');
  self.resize(GetModuleFileNameW(nullptr, self.data(), static_cast<DWORD>(self.size())));
  const std::filesystem::path mark = std::filesystem::path(self).parent_path() /
                                     ("started-" + std::to_string(GetCurrentProcessId()));
  return std::ofstream(mark) ? 0 : 1;
}
