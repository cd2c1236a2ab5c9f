#include "library/folder_grid.h"

#include "base/names.h"

#include <string_view>

bool AllowsSeveralLoaded(char letter) {
  return letter != '\0' && std::string_view("GNXYZK").find(letter) != std::string_view::npos;
}

int FolderGrid::FindShownRow(int from, std::string_view prefix) const {
  const int count = RowCount();
  const std::string wanted = FoldName(prefix);
  for (int step = 0; step < count; ++step) {
    const int row = ((from + step) % count + count) % count;
    const GridRow &candidate = Row(row);
    if (candidate.shown && FoldName(candidate.name).compare(0, wanted.size(), wanted) == 0)
      return row;
  }
  return -1;
}

void FolderGrid::MarkRow(int row, bool loaded) {
  currentRow = row;
  currentCol = 1;
  Row(row).loaded = loaded;
}

std::filesystem::path FolderGrid::PathOf(int row) const { return Child(library, Row(row).name); }

void FolderGrid::ClearFolders() {
  rows.clear();
  currentRow = -1;
}
