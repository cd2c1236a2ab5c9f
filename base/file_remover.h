#pragma once

#include "base/failures.h"

#include <filesystem>
#include <string>

// Deletes files of one folder by name. Where the platform allows, the folder is opened once and
// each deletion names the file relative to it, so that deleting thousands of files costs the
// deletions and no building of full paths.
class FileRemover {
public:
  explicit FileRemover(std::filesystem::path folder);
  ~FileRemover();
  FileRemover(const FileRemover &) = delete;
  FileRemover &operator=(const FileRemover &) = delete;

  // Deletes the file `name`, also a read-only one; true when it did. A file that is not there is
  // no failure; one that cannot be deleted is named in `failures` with the reason.
  bool Remove(const std::string &name, Failures &failures);

private:
  std::filesystem::path folder_;
  int descriptor_ = -1; // the opened folder, -1 where each deletion goes by full path
};
