#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

// A file or folder name as the program keeps it in grids and records: the native bytes on POSIX,
// UTF-8 on Windows.
std::string NameText(const std::filesystem::path &path);
// The path of `name` inside `folder`, the inverse of NameText.
std::filesystem::path Child(const std::filesystem::path &folder, std::string_view name);
// A full path for messages and captions.
std::string DisplayPath(const std::filesystem::path &path);
// ASCII upper case, for comparing names with the program's own ASCII names and extensions;
// other bytes stay as they are.
std::string Upper(std::string_view text);
// Whether every byte of `text` is ASCII: such a name folds to its upper case (see FoldName).
bool IsAscii(std::string_view text);
// The name with its letter case folded the way the file system ignores it, so that two names of
// one file give the same text: on Windows the system's ordinal upper case, elsewhere Unicode
// simple case folding of UTF-8 (ASCII letters in upper case). Bytes that are not UTF-8 stay.
std::string FoldName(std::string_view name);
// The name a file gets when created as `name`: Windows drops trailing blanks and dots.
std::string StoredName(std::string_view name);
// Case-insensitive name order, ties broken by the exact bytes, the same on every platform.
bool NameLess(std::string_view a, std::string_view b);
// Every entry of `folder` whose name equals `name` in any letter case.
std::vector<std::filesystem::path> EntriesAnyCase(const std::filesystem::path &folder,
                                                  std::string_view name);
// The entry of `folder` whose name equals `name` in any letter case, or `folder`/`name` if none.
std::filesystem::path FindAnyCase(const std::filesystem::path &folder, std::string_view name);
