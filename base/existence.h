#pragma once

#include <filesystem>

// Whether `path` is an existing folder; a file, a missing path or an error answers false.
bool FolderCheck(const std::filesystem::path &path);
// Whether `path` is an existing file; a folder, a missing path or an error answers false.
bool FileCheck(const std::filesystem::path &path);
