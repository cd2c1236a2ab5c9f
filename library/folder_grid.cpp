#include "library/folder_grid.h"

#include "base/names.h"

#include <string_view>

bool AllowsSeveralLoaded(char letter) {
  return letter != '\0' && std::string_view("GNXYZK").find(letter) != std::string_view::npos;
}

int FolderGrid::FindShownRow(int from, std::string_view prefix) const {
  const int count = RowCount() - 1;
  const std::string wanted = FoldName(prefix);
  for (int step = 0; step < count; ++step) {
    const int row = 1 + ((from - 1 + step) % count + count) % count;
    const GridRow &candidate = Row(row);
    if (candidate.height > 0 && FoldName(candidate.name).compare(0, wanted.size(), wanted) == 0)
      return row;
  }
  return 0;
}

void FolderGrid::ColourRow(int row, std::uint32_t colour) {
  currentRow = row;
  currentCol = 1;
  Row(row).nameColour = colour;
}

std::filesystem::path FolderGrid::PathOf(int row) const { return Child(library, Row(row).name); }

void FolderGrid::ClearFolders() {
  rows.resize(1);
  currentRow = 0;
}
