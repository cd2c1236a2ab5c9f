#pragma once

#include <filesystem>

// Compares switching between two setups of 20 folders (2,000 files each) with unloading and
// loading the same folders one by one through the Selector, and times the opening of the files
// dialog for a folder of 5,000 files, in game folders under `root`.
void BenchSetups(const std::filesystem::path &root, int pairs);
