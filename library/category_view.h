#pragma once

#include "library/folder_grid.h"

#include <string>
#include <vector>

// Header texts of the folder grid, one per kind of view.
inline constexpr char kAllFoldersText[] = "All folders are available";
inline constexpr char kSingleSelectionText[] = "Only one selection can be made!";
inline constexpr char kMultipleSelectionText[] = "Multiple selections are allowed!";

// The category list's first two entries; the categories follow from kFirstCategoryEntry on.
inline constexpr int kShowAllEntry = 0;
inline constexpr int kShowSelectionsEntry = 1;
inline constexpr int kFirstCategoryEntry = 2;

// Shows category list entry `k` (0 "Show ALL", 1 "Show Selections", then the categories whose
// letters are `codes`): shows and hides folder rows in one pass and sets the grid's rule text.
// Returns the text for the code-letter label. A negative `k` (no entry) changes nothing.
std::string ShowCategory(FolderGrid &grid, const std::vector<std::string> &codes, int k);
