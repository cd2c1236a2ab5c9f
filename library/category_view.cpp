#include "library/category_view.h"

#include "base/text_encoding.h"

#include <cstddef>
#include <string_view>

// The letter followed by "-" or a blank, compared case-sensitively, character with character:
// a name's first character is read the way the category file's letters are.
static bool InCategory(std::string_view name, const std::string &letter) {
  if (letter.empty())
    return false;
  const FirstCharacter first = FirstCharacterOf(name);
  return first.text == letter && name.size() > first.bytes &&
         (name[first.bytes] == '-' || name[first.bytes] == ' ');
}

static void ShowAll(FolderGrid &grid) {
  for (size_t row = 1; row < grid.rows.size(); ++row)
    grid.rows[row].height = kRowHeight;
}

// Shows the loaded rows only; the current cell ends on the last of them.
static void ShowSelections(FolderGrid &grid) {
  for (size_t row = 1; row < grid.rows.size(); ++row) {
    const bool loaded = IsLoaded(grid.rows[row]);
    grid.rows[row].height = loaded ? kRowHeight : 0;
    if (loaded)
      grid.ColourRow(static_cast<int>(row), kLoadedColour);
  }
}

static void ShowLetter(FolderGrid &grid, const std::string &letter) {
  for (size_t row = 1; row < grid.rows.size(); ++row)
    grid.rows[row].height = InCategory(grid.rows[row].name, letter) ? kRowHeight : 0;
  const bool several = letter.size() == 1 && AllowsSeveralLoaded(letter[0]);
  grid.rows[0].name = several ? kMultipleSelectionText : kSingleSelectionText;
}

std::string ShowCategory(FolderGrid &grid, const std::vector<std::string> &codes, int k) {
  if (k < 0)
    return "";
  grid.rows[0].name = kAllFoldersText;
  if (k == kShowAllEntry) {
    ShowAll(grid);
    return "";
  }
  if (k == kShowSelectionsEntry) {
    ShowSelections(grid);
    return "";
  }
  // An entry past the known categories has no letter, so it shows no folder.
  const size_t index = static_cast<size_t>(k - kFirstCategoryEntry);
  const std::string letter = index < codes.size() ? codes[index] : "";
  ShowLetter(grid, letter);
  return letter;
}
