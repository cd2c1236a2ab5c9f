#include "library/record_replay.h"

#include "base/text_encoding.h"
#include "library/grid_click.h"
#include "library/loaded_record.h"

#include <unordered_map>
#include <vector>

void ReplayRecord(LibraryState &state, Caption &caption, Failures &failures) {
  const ReadyGuard replaying(state, false);
  FolderGrid &grid = state.Unigrid;
  // Index the recorded names, not the rows, and find their rows in one pass: a library of tens
  // of thousands of folders then costs no copy of its names.
  const std::vector<std::string> lines = ReadLoadedNames(state, failures);
  std::unordered_map<std::string, std::vector<int>> rowsByName;
  for (const std::string &line : lines) {
    rowsByName[line];
    rowsByName[TextAsUtf8(line)];
  }
  for (int row = 1; row < grid.RowCount(); ++row)
    if (const auto found = rowsByName.find(grid.Row(row).name); found != rowsByName.end())
      found->second.push_back(row);
  std::vector<int> recorded;
  for (const std::string &line : lines) {
    // A record written in Windows-1252 names the folders that UTF-8 names differently.
    const std::vector<int> &named = rowsByName[line];
    const std::vector<int> rows = named.empty() ? rowsByName[TextAsUtf8(line)] : named;
    for (int row : rows) {
      grid.Row(row).mark.clear();
      grid.ColourRow(row, kLoadedColour);
      library::ClickRow(state, row, caption, failures);
    }
    recorded.insert(recorded.end(), rows.begin(), rows.end());
  }
  // The click's one-per-category rule unmarks an earlier folder of the letter, yet its copies are
  // in the game: every recorded folder shows loaded, so that it can be unloaded.
  for (int row : recorded) {
    grid.Row(row).mark = kLoadedMark;
    grid.ColourRow(row, kLoadedColour);
  }
}
