#include "base/existence.h"

#include <system_error>

namespace fs = std::filesystem;

bool FolderFound = false;
bool FileFound = false;

void FolderCheck(const fs::path &path) {
  std::error_code error;
  FolderFound = fs::is_directory(path, error);
}

void FileCheck(const fs::path &path) {
  std::error_code error;
  const fs::file_status status = fs::status(path, error);
  FileFound = !error && fs::exists(status) && !fs::is_directory(status);
}
