#pragma once

#include <filesystem>

// Runs the program for the game folder `eawDir`: refuses a second instance, else shows the
// window until it is closed. Returns the exit code.
int RunSelector(const std::filesystem::path &eawDir);
