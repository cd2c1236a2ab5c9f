#pragma once

#include <filesystem>
#include <string>

// Compares loading, unloading and Reset All, done through the program's verbs, with plain loops
// doing the same file work, in game folders under `root`: all of them for `only` "files", else
// the lines it names ("window", "loads", "keeping", "unloads" or "reset").
void BenchFileWork(const std::filesystem::path &root, int pairs, const std::string &only);
// Compares loading 20 files of 50 MB, which copy_file_range clones, with a copy_file loop, on a
// file system under `root` that shares blocks (XFS with reflink, Btrfs).
void BenchCloneLoad(const std::filesystem::path &root, int pairs);
