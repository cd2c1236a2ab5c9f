#include "base/existence.h"

#include <system_error>

namespace fs = std::filesystem;

bool FolderCheck(const fs::path &path) {
  std::error_code error;
  return fs::is_directory(path, error);
}

bool FileCheck(const fs::path &path) {
  std::error_code error;
  const fs::file_status status = fs::status(path, error);
  return !error && fs::exists(status) && !fs::is_directory(status);
}
