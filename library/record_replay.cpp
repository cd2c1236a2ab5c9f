#include "library/record_replay.h"

#include "base/text_encoding.h"
#include "library/grid_click.h"
#include "library/loaded_record.h"

#include <algorithm>
#include <unordered_map>
#include <vector>

void ReplayRecord(LibraryState &state, Caption &caption, Failures &failures) {
  const ReadyGuard replaying(state, false);
  FolderGrid &grid = state.Unigrid;
  // Index the rows by name once, so that a long record costs no more than the grid itself.
  std::unordered_multimap<std::string, int> rowsByName;
  for (int row = 1; row < grid.RowCount(); ++row)
    rowsByName.emplace(grid.Row(row).name, row);
  std::vector<int> recorded;
  for (const std::string &line : ReadLoadedNames(state, failures)) {
    // A record written in Windows-1252 names the folders that UTF-8 names differently.
    const std::string name = rowsByName.count(line) ? line : TextAsUtf8(line);
    auto [first, last] = rowsByName.equal_range(name);
    std::vector<int> rows;
    for (auto it = first; it != last; ++it)
      rows.push_back(it->second);
    std::sort(rows.begin(), rows.end());
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
