#pragma once

#include "base/failures.h"

#include <filesystem>
#include <string>

// Makes the set `chosenName` the game's music: renames the "Music" folder to `activeName`, then
// the chosen set's folder to "Music". Every refusal is decided before the first rename; when the
// second rename fails anyway the first is undone. The two folders are noted in the file
// `journal` first, so that a switch cut short by a crash can be finished. Returns whether the
// switch was made; failures are recorded.
bool SwitchMusic(const std::filesystem::path &eawDir, const std::string &activeName,
                 const std::string &chosenName, const std::filesystem::path &journal,
                 Failures &failures);
// Finishes a switch that `journal` shows was cut short: when the game has no "Music" folder, the
// chosen set becomes it (or, if that is gone, the set put away becomes it again). A journal line
// that names another folder, and a link in the way, are named in `failures` and change nothing.
void FinishMusicSwitch(const std::filesystem::path &eawDir, const std::filesystem::path &journal,
                       Failures &failures);
