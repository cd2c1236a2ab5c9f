#include "library/folder_grid.h"

void FolderGrid::ColourRow(int row, std::uint32_t colour) {
  currentRow = row;
  currentCol = 1;
  rows[static_cast<size_t>(row)].nameColour = colour;
}

void FolderGrid::ClearFolders() {
  rows.resize(1);
  currentRow = 0;
}
