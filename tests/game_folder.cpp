#include "tests/game_folder.h"

#include <algorithm>

const GameFolder &GameFolder::WithGameFolders() const {
  MakeFolder("Savedata");
  MakeFolder("Music");
  return *this;
}

const GameFolder &GameFolder::WithCategories(const std::string &lines) const {
  Write("ZEP128/zep.ini", lines);
  return *this;
}

const GameFolder &GameFolder::WithRecord(const std::string &bytes) const {
  Write("ZEP128/FoldersLoaded.txt", bytes);
  return *this;
}

fs::path GameFolder::Addon(const std::string &name,
                           std::initializer_list<const char *> files) const {
  const fs::path folder = MakeFolder("ZEP128/" + name);
  for (const char *file : files)
    Write("ZEP128/" + name + "/" + file, file);
  return folder;
}

bool RecordingCaption::Showed(const std::string &line) const {
  return std::find_if(shown.begin(), shown.end(), [&](const std::string &text) {
           return text == line || text.rfind(line + " (", 0) == 0;
         }) != shown.end();
}

::testing::AssertionResult OneFailure(const Failures &failures, const std::string &part) {
  if (failures.Lines().size() == 1)
    return Contains(failures.Lines()[0], part);
  return ::testing::AssertionFailure() << failures.Lines().size() << " failures, not one:\n"
                                       << failures.Message("");
}

std::vector<std::string> RowNames(const FolderGrid &grid, bool marks) {
  Names names;
  for (int row = 0; row < grid.RowCount(); ++row)
    names.push_back(grid.Row(row).name + (marks && IsLoaded(grid.Row(row)) ? " [S]" : ""));
  return names;
}

int RowOf(const FolderGrid &grid, const std::string &name) {
  for (int row = 0; row < grid.RowCount(); ++row)
    if (grid.Row(row).name == name)
      return row;
  return -1;
}
