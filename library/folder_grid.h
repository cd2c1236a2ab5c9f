#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

// The category letter of flight-model folders, whose loaded folder fills the slot panel.
inline constexpr char kFlightModelLetter = 'F';

// One row of the folder grid: a folder of the library, whether it is loaded and whether the
// shown category holds it (its path is FolderGrid::PathOf).
struct GridRow {
  std::string name;
  bool loaded = false;
  bool shown = true;
};

// Whether the row's folder is loaded.
inline bool IsLoaded(const GridRow &row) { return row.loaded; }
// The category letter of a row: the first character of its name, '\0' for none.
inline char Letter(const GridRow &row) { return row.name.empty() ? '\0' : row.name.front(); }
// Whether a category letter allows several loaded folders at once.
bool AllowsSeveralLoaded(char letter);

// The folder grid `Unigrid`: rows from 0, one per folder; `rule` is the text that says how many
// folders the shown category allows loaded, for the grid's header.
struct FolderGrid {
  std::vector<GridRow> rows;
  std::string rule;
  std::filesystem::path library; // the folder that holds the rows' folders
  int currentRow = -1;           // -1 for none
  int currentCol = 1;

  int RowCount() const { return static_cast<int>(rows.size()); }
  GridRow &Row(int row) { return rows[static_cast<size_t>(row)]; }
  const GridRow &Row(int row) const { return rows[static_cast<size_t>(row)]; }
  // Whether `row` is a folder row (not past either end).
  bool IsFolderRow(int row) const { return row >= 0 && row < RowCount(); }
  // The folder of `row`: made when asked, so that a library of thousands of folders costs one
  // name per row.
  std::filesystem::path PathOf(int row) const;
  // The first shown row from `from` on, going round past the end, whose name starts with
  // `prefix` in any letter case; -1 when there is none.
  int FindShownRow(int from, std::string_view prefix) const;
  // Makes (row, column 1) the current cell and marks the row loaded or not.
  void MarkRow(int row, bool loaded);
  // Drops every row; no row is current.
  void ClearFolders();
};
