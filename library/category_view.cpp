#include "library/category_view.h"

#include <cstddef>
#include <string_view>

static bool AllowsMultipleSelections(std::string_view letter) {
  return letter == "G" || letter == "N" || letter == "X" || letter == "Y" || letter == "Z" ||
         letter == "K";
}

// The letter followed by "-" or a blank, compared case-sensitively.
static bool InCategory(std::string_view name, std::string_view letter) {
  const size_t n = letter.size();
  return n > 0 && name.size() > n && name.compare(0, n, letter) == 0 &&
         (name[n] == '-' || name[n] == ' ');
}

static void ShowAll(FolderGrid &grid) {
  for (size_t row = 1; row < grid.rows.size(); ++row)
    grid.rows[row].height = kRowHeight;
}

// Shows the loaded rows only; the current cell ends on the last of them.
static void ShowSelections(FolderGrid &grid) {
  for (size_t row = 1; row < grid.rows.size(); ++row) {
    const bool loaded = grid.rows[row].mark == "S";
    grid.rows[row].height = loaded ? kRowHeight : 0;
    if (loaded)
      grid.ColourRow(static_cast<int>(row), kLoadedColour);
  }
}

static void ShowCategory(FolderGrid &grid, const std::string &letter) {
  for (size_t row = 1; row < grid.rows.size(); ++row)
    grid.rows[row].height = InCategory(grid.rows[row].name, letter) ? kRowHeight : 0;
  grid.rows[0].name =
      AllowsMultipleSelections(letter) ? kMultipleSelectionText : kSingleSelectionText;
}

std::string List3Click(AppState &state, int k) {
  if (k < 0)
    return "";
  FolderGrid &grid = state.Unigrid;
  grid.rows[0].name = kAllFoldersText;
  if (k == 0) {
    ShowAll(grid);
    return "";
  }
  if (k == 1) {
    ShowSelections(grid);
    return "";
  }
  // An entry past the known categories has no letter, so it shows no folder.
  const size_t index = static_cast<size_t>(k - 2);
  const std::string letter = index < state.Codes.size() ? state.Codes[index] : "";
  ShowCategory(grid, letter);
  return letter;
}
