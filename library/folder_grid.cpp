#include "library/folder_grid.h"

#include <string_view>

bool AllowsSeveralLoaded(char letter) {
  return letter != '\0' && std::string_view("GNXYZK").find(letter) != std::string_view::npos;
}

void FolderGrid::ColourRow(int row, std::uint32_t colour) {
  currentRow = row;
  currentCol = 1;
  Row(row).nameColour = colour;
}

void FolderGrid::ClearFolders() {
  rows.resize(1);
  currentRow = 0;
}
