#pragma once

#include "library/file_rules.h"
#include "library/folder_grid.h"
#include "slots/slot_table.h"

#include <array>
#include <filesystem>
#include <optional>

// What the last operation did to the game's files, for the line that sums it up.
struct Tally {
  int copied = 0;   // files copied in from a folder being loaded
  int removed = 0;  // files taken out of the game
  int restored = 0; // files put back: another loaded folder's copy or a kept original
};

// What loading, unloading, the record and the grid views share: the paths, the folder grid and
// the slot panel.
struct LibraryState {
  std::filesystem::path EAWDir;
  std::filesystem::path LibDir;
  FolderGrid Unigrid;
  SlotPanel Slots;
  Tally tally;
  // The game's place folders as found once for the operation under way (see PlacesScope).
  std::optional<std::array<std::filesystem::path, kPlaceCount>> places;
};

// The library state for the game folder `eawDir`, with `LibDir` (its "ZEP128" in any case).
LibraryState LibraryFor(const std::filesystem::path &eawDir);
