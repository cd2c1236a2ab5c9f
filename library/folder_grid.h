#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

// OLE colour (&HBBGGRR) of a loaded row's name cell: light green.
inline constexpr std::uint32_t kLoadedColour = 12648384;
// Height in twips of a shown row; a hidden row has height 0.
inline constexpr int kRowHeight = 240;

// One row of the folder grid: column 0 the path, column 1 the name, column 2 the mark.
struct GridRow {
  std::filesystem::path path;
  std::string name;
  std::string mark;
  std::uint32_t nameColour = 0; // 0 is the grid's default (white)
  int height = kRowHeight;
};

// The folder grid `Unigrid`: row 0 is the header row, whose name cell carries the rule text.
struct FolderGrid {
  std::vector<GridRow> rows{GridRow{}};
  int currentRow = 0;
  int currentCol = 1;

  int RowCount() const { return static_cast<int>(rows.size()); }
  // Makes (row, column 1) the current cell and gives it `colour`.
  void ColourRow(int row, std::uint32_t colour);
  // Drops every folder row; the header row stays.
  void ClearFolders();
};
