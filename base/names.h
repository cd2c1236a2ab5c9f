#pragma once

#include <filesystem>
#include <string>
#include <string_view>

// A file or folder name as the program keeps it in grids and records: the native bytes on POSIX,
// UTF-8 on Windows.
std::string NameText(const std::filesystem::path &path);
// The path of `name` inside `folder`, the inverse of NameText.
std::filesystem::path Child(const std::filesystem::path &folder, std::string_view name);
// A full path for messages and captions.
std::string DisplayPath(const std::filesystem::path &path);
// ASCII upper case, the way file names are compared; other bytes stay as they are.
std::string Upper(std::string_view text);
bool EndsWith(std::string_view text, std::string_view tail);
bool StartsWith(std::string_view text, std::string_view head);
// Case-insensitive name order, ties broken by the exact bytes, the same on every platform.
bool NameLess(std::string_view a, std::string_view b);
// The entry of `folder` whose name equals `name` in any letter case, or `folder`/`name` if none.
std::filesystem::path FindAnyCase(const std::filesystem::path &folder, std::string_view name);
