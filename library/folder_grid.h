#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

// OLE colour (&HBBGGRR) of a loaded row's name cell: light green.
inline constexpr std::uint32_t kLoadedColour = 12648384;
// Height in twips of a shown row; a hidden row has height 0.
inline constexpr int kRowHeight = 240;
// The text of column 2 that marks a row as loaded.
inline constexpr char kLoadedMark[] = "S";

// The grid's height in twips for `rowCount` rows: 20 rows at most, plus 72.
inline int GridHeightTwips(int rowCount) {
  return kRowHeight * (rowCount < 20 ? rowCount : 20) + 72;
}

// One row of the folder grid: column 1 the name, column 2 the mark (column 0, the path, is
// FolderGrid::PathOf).
struct GridRow {
  std::string name;
  std::string mark;
  std::uint32_t nameColour = 0; // 0 is the grid's default (white)
  int height = kRowHeight;
};

// Whether the row's folder is loaded.
inline bool IsLoaded(const GridRow &row) { return row.mark == kLoadedMark; }
// The category letter of a row: the first character of its name, '\0' for none.
inline char Letter(const GridRow &row) { return row.name.empty() ? '\0' : row.name.front(); }
// Whether a category letter allows several loaded folders at once.
bool AllowsSeveralLoaded(char letter);

// The folder grid `Unigrid`: row 0 is the header row, whose name cell carries the rule text.
struct FolderGrid {
  std::vector<GridRow> rows{GridRow{}};
  std::filesystem::path library; // the folder that holds the rows' folders
  int currentRow = 0;
  int currentCol = 1;

  int RowCount() const { return static_cast<int>(rows.size()); }
  GridRow &Row(int row) { return rows[static_cast<size_t>(row)]; }
  const GridRow &Row(int row) const { return rows[static_cast<size_t>(row)]; }
  // Whether `row` is a folder row (not the header row, not past the end).
  bool IsFolderRow(int row) const { return row >= 1 && row < RowCount(); }
  // The folder of `row`: made when asked, so that a library of thousands of folders costs one
  // name per row.
  std::filesystem::path PathOf(int row) const;
  // The first shown folder row from `from` on, going round past the end, whose name starts with
  // `prefix` in any letter case; 0 when there is none.
  int FindShownRow(int from, std::string_view prefix) const;
  // Makes (row, column 1) the current cell and gives it `colour`.
  void ColourRow(int row, std::uint32_t colour);
  // Drops every folder row; the header row stays.
  void ClearFolders();
};
