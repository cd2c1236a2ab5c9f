#pragma once

#include <filesystem>
#include <string>
#include <unordered_set>
#include <vector>

// File operations that could not be done, gathered so that the user is told once per event.
class Failures {
public:
  // Records that the operation on `path` failed for `reason`.
  void Add(const std::filesystem::path &path, const std::string &reason);
  // Records a failure that concerns no single file.
  void Add(const std::string &text);
  // Adds the failures of `later` after these, and its heading when it has one.
  void Append(const Failures &later);
  bool Empty() const { return lines_.empty(); }
  const std::vector<std::string> &Lines() const { return lines_; }
  // Gives the message a heading that says more than the caller's: what the failures mean.
  void SetHeading(const std::string &heading) { heading_ = heading; }
  // The heading set by SetHeading, or else `fallback`.
  const std::string &HeadingOr(const std::string &fallback) const {
    return heading_.empty() ? fallback : heading_;
  }
  // One message naming every failure, one per line, after the heading (`fallback` when none was
  // set).
  std::string Message(const std::string &fallback) const;

private:
  std::vector<std::string> lines_;
  std::unordered_set<std::string> seen_; // each failure is told once, found in constant time
  std::string heading_;
};
