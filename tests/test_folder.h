#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <initializer_list>
#include <map>
#include <string>
#include <vector>

namespace fs = std::filesystem;
// Names as the tests compare them: of files, folders, rows or lines.
using Names = std::vector<std::string>;

// A fresh folder under the system's temporary folder, removed with everything in it at the end.
class TestFolder {
public:
  TestFolder();
  ~TestFolder();
  TestFolder(const TestFolder &) = delete;
  TestFolder &operator=(const TestFolder &) = delete;

  const std::filesystem::path &Path() const { return path_; }
  // Writes `bytes` to `relative` (UTF-8, "/" between names), creating the folders on the way.
  std::filesystem::path Write(const std::string &relative, const std::string &bytes = "x") const;
  // Creates the folder `relative` and those on the way.
  std::filesystem::path MakeFolder(const std::string &relative) const;
  bool Exists(const std::string &relative) const;
  // Passes when every one of `relatives` exists (or, with `exist` false, none does); a failure
  // names those that do not match.
  ::testing::AssertionResult All(std::initializer_list<std::string> relatives,
                                 bool exist = true) const;
  ::testing::AssertionResult None(std::initializer_list<std::string> relatives) const {
    return All(relatives, false);
  }
  std::string Read(const std::string &relative) const;

private:
  std::filesystem::path path_;
};

// Passes when `text` contains `part`; a failure shows the text.
::testing::AssertionResult Contains(const std::string &text, const std::string &part);
// Whether `folder` holds two files whose names differ only in letter case as two files.
bool IsCaseSensitive(const std::filesystem::path &folder);
// Whether `path` can be written to by its owner.
bool IsWritable(const std::filesystem::path &path);
// Makes `path` read-only (or writable again).
void SetReadOnly(const std::filesystem::path &path, bool readOnly);
// Every entry below `folder` but those below its child `skipped`, without following links: its
// kind, whether it is writable and a file's bytes, by path.
std::map<std::string, std::string> Snapshot(const std::filesystem::path &folder,
                                            const std::string &skipped = "");
// Makes `link` a link to the folder `target`; false where this program may make none.
bool MakeFolderLink(const std::filesystem::path &target, const std::filesystem::path &link);
