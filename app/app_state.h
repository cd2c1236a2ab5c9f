#pragma once

#include "library/folder_grid.h"
#include "slots/slot_table.h"

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

// The program's shared state: paths, flags, categories, the folder grid and the slot panel.
struct AppState {
  std::filesystem::path EAWDir;
  std::filesystem::path LibDir;
  bool Ready = false;
  std::vector<std::string> List3; // "Show ALL", "Show Selections", then one per category
  std::vector<std::string> Codes; // Codes[k] is the letter of List3 entry k + 2
  std::filesystem::path BackPic;  // empty when there is no background picture
  int ClickedRow = 0;
  int OtherRow = 0;
  int HoverRow = -1;
  std::uint32_t GridBackColor = 0; // 0 shows as the grid's default white
  bool PlaneSetFound = false;
  FolderGrid Unigrid;
  SlotPanel Slots;
};

// The state for the game folder `eawDir`, with `LibDir` (its "ZEP128" in any case), before
// start-up.
AppState StateFor(const std::filesystem::path &eawDir);
