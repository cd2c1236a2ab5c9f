#include "base/links.h"

#ifdef _WIN32
#include <windows.h>
#else
#include <sys/stat.h>
#endif

namespace fs = std::filesystem;

bool IsLink(const fs::path &path) {
#ifdef _WIN32
  // The standard library of MinGW sees no links at all: the attribute tells every kind.
  const DWORD attributes = GetFileAttributesW(path.c_str());
  return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_REPARSE_POINT);
#else
  struct stat info {};
  return ::lstat(path.c_str(), &info) == 0 && S_ISLNK(info.st_mode);
#endif
}

void RefuseLink(const fs::path &link, const std::string &consequence, Failures &failures) {
  failures.Add(link, std::string(kLinkReason) + "; " + consequence);
}
