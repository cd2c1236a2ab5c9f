#include "library/loaded_record.h"

#include "app/existence.h"
#include "app/names.h"
#include "app/text_file.h"

namespace fs = std::filesystem;

fs::path RecordPath(const AppState &state) {
  return FindAnyCase(state.LibDir, "FoldersLoaded.txt");
}

std::string RecordText(const FolderGrid &grid) {
  std::string text;
  for (int row = 1; row < grid.RowCount(); ++row) {
    const GridRow &r = grid.rows[static_cast<size_t>(row)];
    if (r.mark == "S")
      text += r.name + "\r\n";
  }
  return text + "\r\n";
}

void SaveLoaded(AppState &state, Failures &failures) {
  if (!state.Ready)
    return;
  state.Ready = false;
  WriteAtomically(RecordPath(state), RecordText(state.Unigrid), failures);
  state.Ready = true;
}

std::vector<std::string> ReadLoadedNames(const AppState &state, Failures &failures) {
  std::vector<std::string> names;
  FileCheck(RecordPath(state));
  if (!FileFound)
    return names;
  if (auto lines = ReadLines(RecordPath(state), failures)) {
    for (std::string &line : *lines)
      if (!line.empty())
        names.push_back(std::move(line));
  }
  return names;
}

void EnsureRecord(const AppState &state, Failures &failures) {
  FileCheck(RecordPath(state));
  if (!FileFound)
    WriteAtomically(RecordPath(state), "", failures);
}
