#pragma once

#include <filesystem>

// Answer of the most recent FolderCheck.
extern bool FolderFound;
// Answer of the most recent FileCheck.
extern bool FileFound;

// Sets FolderFound: whether `path` is an existing folder (a file answers false).
void FolderCheck(const std::filesystem::path &path);
// Sets FileFound: whether `path` is an existing file (a folder answers false).
void FileCheck(const std::filesystem::path &path);
