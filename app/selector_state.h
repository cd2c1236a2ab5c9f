#pragma once

#include "library/library_state.h"

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

// Everything the window draws: the library, the category list and the pictures.
struct SelectorState : LibraryState {
  std::vector<std::string> List3; // "Show ALL", "Show Selections", then one per category
  std::vector<std::string> Codes; // Codes[k] is the letter of List3 entry k + 2
  std::filesystem::path BackPic;  // empty when there is no background picture
  std::filesystem::path NewPic;   // the General Settings page's picture; empty for none
  std::optional<int> hoveredRow;  // the grid row whose preview is shown, -1 the header
  int shownCategory = 0;          // the category list entry the grid shows
};
