#pragma once

#include "base/failures.h"

#include <filesystem>
#include <string>

// Makes the set `chosenName` the game's music: renames the "Music" folder to `activeName`, then
// the chosen set's folder to "Music". When the second rename fails the first is undone; without
// an active name nothing is renamed. Returns whether the switch was made; failures are recorded.
bool SwitchMusic(const std::filesystem::path &eawDir, const std::string &activeName,
                 const std::string &chosenName, Failures &failures);
