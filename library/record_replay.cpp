#include "library/record_replay.h"

#include "base/text_encoding.h"
#include "library/loaded_record.h"
#include "slots/slot_grid.h"

#include <unordered_map>
#include <vector>

void ReplayRecord(LibraryState &state, Failures &failures) {
  FolderGrid &grid = state.Unigrid;
  // Index the recorded names, not the rows, and find their rows in one pass: a library of tens
  // of thousands of folders then costs no copy of its names.
  const std::vector<std::string> lines = ReadLoadedNames(state, failures);
  std::unordered_map<std::string, std::vector<int>> rowsByName;
  for (const std::string &line : lines) {
    rowsByName[line];
    rowsByName[TextAsUtf8(line)];
  }
  for (int row = 0; row < grid.RowCount(); ++row)
    if (const auto found = rowsByName.find(grid.Row(row).name); found != rowsByName.end())
      found->second.push_back(row);
  for (const std::string &line : lines) {
    // A record written in Windows-1252 names the folders that UTF-8 names differently.
    const std::vector<int> &named = rowsByName[line];
    for (int row : named.empty() ? rowsByName[TextAsUtf8(line)] : named) {
      grid.MarkRow(row, true);
      if (Letter(grid.Row(row)) == kFlightModelLetter)
        GridSet(state.Slots, grid.PathOf(row), failures);
    }
  }
}
