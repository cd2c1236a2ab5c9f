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
  for (GridRow &row : grid.rows)
    row.shown = true;
}

// Shows the loaded rows only; the current cell ends on the last of them.
static void ShowSelections(FolderGrid &grid) {
  for (int row = 0; row < grid.RowCount(); ++row) {
    const bool loaded = IsLoaded(grid.Row(row));
    grid.Row(row).shown = loaded;
    if (loaded)
      grid.MarkRow(row, true);
  }
}

static void ShowLetter(FolderGrid &grid, const std::string &letter) {
  for (GridRow &row : grid.rows)
    row.shown = InCategory(row.name, letter);
  const bool several = letter.size() == 1 && AllowsSeveralLoaded(letter[0]);
  grid.rule = several ? kMultipleSelectionText : kSingleSelectionText;
}

std::string ShowCategory(FolderGrid &grid, const std::vector<std::string> &codes, int k) {
  if (k < 0)
    return "";
  grid.rule = kAllFoldersText;
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
