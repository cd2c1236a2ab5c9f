#pragma once

#include "base/caption.h"
#include "base/failures.h"

#include <filesystem>
#include <string_view>

// Whether `folder` is a campaign folder: its own name starts with "C " or "C-" (case-sensitive);
// the folders above it do not count.
bool IsCampaignFolder(const std::filesystem::path &folder);
// The same for a folder's name alone.
bool IsCampaignName(std::string_view name);
// Moves every save file ("*.sve") of the game's "Savedata" into `campaign`: each is deleted from
// "Savedata" only after its copy is complete. A file that cannot be moved stays where it is and is
// recorded in `failures`; the others are still moved.
void CarrySaveFiles(const std::filesystem::path &eawDir, const std::filesystem::path &campaign,
                    Caption &caption, Failures &failures);
// Removes what a carry of save files into `campaign` cut short by a crash left: its temporary
// copies "*.sve.partial", and no other file of the folder.
void RemoveHalfCarried(const std::filesystem::path &campaign);
