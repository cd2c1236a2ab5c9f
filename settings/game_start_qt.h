#pragma once

#include <filesystem>
#include <string>

// Starts the game's eaw.exe in `eawDir` as an independent process without arguments ("FLY");
// outside Windows through wine when it is installed. Returns an empty text when the game was
// started, otherwise the message naming the path.
std::string StartGame(const std::filesystem::path &eawDir);
