#pragma once

#include <filesystem>
#include <string>
#include <vector>

// File operations that could not be done, gathered so that the user is told once per event.
class Failures {
public:
  // Records that the operation on `path` failed for `reason`.
  void Add(const std::filesystem::path &path, const std::string &reason);
  // Records a failure that concerns no single file.
  void Add(const std::string &text);
  bool Empty() const { return lines_.empty(); }
  const std::vector<std::string> &Lines() const { return lines_; }
  // One message naming every failure, one per line, after `heading`.
  std::string Message(const std::string &heading) const;

private:
  std::vector<std::string> lines_;
};
