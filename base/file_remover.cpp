#include "base/file_remover.h"

#include "base/file_ops.h"
#include "base/names.h"

#include <cerrno>
#include <system_error>

#ifndef _WIN32
#include <fcntl.h>
#include <unistd.h>
#endif

namespace fs = std::filesystem;

#ifdef _WIN32
// Windows has no deletion relative to an open folder that a program may call.
FileRemover::FileRemover(fs::path folder) : folder_(std::move(folder)) {}

FileRemover::~FileRemover() = default;

bool FileRemover::Remove(const std::string &name, Failures &failures) {
  const fs::path path = Child(folder_, name);
  std::error_code error;
  return fs::exists(path, error) && RemoveFile(path, failures);
}
#else
FileRemover::FileRemover(fs::path folder)
    : folder_(std::move(folder)),
      descriptor_(::open(folder_.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC)) {}

FileRemover::~FileRemover() {
  if (descriptor_ >= 0)
    ::close(descriptor_);
}

bool FileRemover::Remove(const std::string &name, Failures &failures) {
  if (descriptor_ < 0) {
    const fs::path path = Child(folder_, name);
    std::error_code error;
    return fs::exists(path, error) && RemoveFile(path, failures);
  }
  if (::unlinkat(descriptor_, name.c_str(), 0) == 0)
    return true;
  if (errno == ENOENT)
    return false;
  const std::error_code error(errno, std::generic_category());
  failures.Add(Child(folder_, name), "cannot be deleted (" + error.message() + ")");
  return false;
}
#endif
