#include "base/file_remover.h"

#include "base/file_ops.h"
#include "base/links.h"
#include "base/names.h"
#include "base/new_file.h"
#include "base/step_seam.h"

#include <cerrno>
#include <system_error>

#ifndef _WIN32
#include <fcntl.h>
#include <unistd.h>
#endif

namespace fs = std::filesystem;

// Deletes by full path: where the folder could not be opened, and on Windows, which has no
// deletion relative to an open folder that a program may call.
static bool RemoveByPath(const fs::path &path, Failures &failures) {
  std::error_code error;
  return (IsLink(path) || fs::exists(fs::symlink_status(path, error))) &&
         RemoveFile(path, failures);
}

#ifdef _WIN32
FileRemover::FileRemover(fs::path folder) : folder_(std::move(folder)) {}

FileRemover::~FileRemover() = default;

bool FileRemover::Remove(const std::string &name, Failures &failures) {
  return RemoveByPath(Child(folder_, name), failures);
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
  if (descriptor_ < 0)
    return RemoveByPath(Child(folder_, name), failures);
  if (::unlinkat(descriptor_, name.c_str(), 0) == 0) {
    StepDone();
    return true;
  }
  if (errno == ENOENT)
    return false;
  const std::error_code error(errno, std::generic_category());
  failures.Add(Child(folder_, name), "cannot be deleted (" + ReasonFor(name, error) + ")");
  return false;
}
#endif
