#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

// The plain files of one folder that are named like one of the names asked about, by folded name
// (see FoldName): a single listing answers any number of case-insensitive look-ups, and holds
// only what is asked, however many files the folder has. Hidden and system files count: a file
// that a copy would replace is one, whatever its attributes.
class NameIndex {
public:
  // Lists `folder` once, keeping the files that equal one of `wanted` in any letter case.
  NameIndex(const std::filesystem::path &folder, const std::vector<std::string> &wanted);
  // The names of the folder's files that equal `name` in any letter case; `name` must be one of
  // the wanted names or one added since.
  const std::vector<std::string> &Matches(std::string_view name) const;
  // The name a copy of `name` is stored under: the existing file of that name in any case, so
  // that the folder never holds two files differing only in case; `name` itself otherwise.
  std::string TargetName(const std::string &name) const;
  // Notes that `name` now exists, or no longer does.
  void Add(const std::string &name);
  void Remove(const std::string &name);

private:
  std::unordered_map<std::string, std::vector<std::string>> byFolded_;
};
