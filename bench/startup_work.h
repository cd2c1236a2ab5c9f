#pragma once

#include <filesystem>

// Compares the start-up on a library of 5,000 folders, 500 of them loaded, with the start-up on
// an empty library: the time from starting the program until its window is shown, the heap it
// then holds, and for information the window's part alone in a process that is already running.
void BenchStartUp(const std::filesystem::path &root, int pairs);
// The child process of that comparison: opens the window on `game`, lets it draw once and ends
// at once, without tearing down. Returns the exit code.
int ShowWindowAndEnd(const std::filesystem::path &game, int argc, char **argv);
