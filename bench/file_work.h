#pragma once

#include <filesystem>

// Compares loading, unloading and Reset All, done through the program's verbs, with plain loops
// doing the same file work, in game folders under `root`.
void BenchFileWork(const std::filesystem::path &root, int pairs);
