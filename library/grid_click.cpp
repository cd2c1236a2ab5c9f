#include "library/grid_click.h"

#include "base/existence.h"
#include "base/new_file.h"
#include "base/text_encoding.h"
#include "library/game_places.h"
#include "library/keeping.h"
#include "library/kept_links.h"
#include "library/loaded_record.h"
#include "library/move_in.h"
#include "library/move_out.h"
#include "slots/slot_grid.h"

namespace fs = std::filesystem;

namespace {

constexpr char kCampaign = 'C';

// The first loaded row of `letter`, or -1.
int FirstLoaded(const FolderGrid &grid, char letter) {
  for (int row = 0; row < grid.RowCount(); ++row)
    if (IsLoaded(grid.Row(row)) && Letter(grid.Row(row)) == letter)
      return row;
  return -1;
}

// The last loaded row whose first character is `letter`, or -1.
int LastLoaded(const FolderGrid &grid, const std::string &letter) {
  for (int row = grid.RowCount() - 1; row >= 0; --row)
    if (IsLoaded(grid.Row(row)) && FirstCharacterOf(grid.Row(row).name).text == letter)
      return row;
  return -1;
}

// Loads the folder of `row` and marks it loaded, even when some files could not be copied: those
// that were can still be unloaded. Returns the loaded folders whose files it replaced.
std::vector<std::string> Load(LibraryState &state, int row, Caption &caption, Failures &failures) {
  const size_t before = failures.Lines().size();
  const std::optional<std::vector<std::string>> overwritten =
      MoveIn(state, state.Unigrid.PathOf(row), caption, failures);
  // A folder that was not loaded at all is not marked: there is nothing to unload.
  if (!overwritten)
    return {};
  state.Unigrid.MarkRow(row, true);
  SaveLoaded(state, failures);
  Journal::Remove(KeepingFolder(state.LibDir));
  if (failures.Lines().size() > before)
    failures.SetHeading("\"" + state.Unigrid.Row(row).name +
                        "\" is only partly loaded: the files below are missing from the game, "
                        "each with the reason. Mend what the reasons say (free some disk space, "
                        "close the game if it is running), then unload the folder and load it "
                        "again.");
  return *overwritten;
}

// At most one campaign is loaded; loading another first unloads the loaded one, which carries
// the save files home into its folder.
std::vector<std::string> ClickCampaign(LibraryState &state, int clicked, Caption &caption,
                                       Failures &failures) {
  const fs::path folder = state.Unigrid.PathOf(clicked);
  if (IsLoaded(state.Unigrid.Row(clicked))) {
    state.Unigrid.MarkRow(clicked, false);
    MoveOut(state, folder, caption, failures);
    SaveLoaded(state, failures);
    return {};
  }
  const int other = FirstLoaded(state.Unigrid, kCampaign);
  if (other >= 0) {
    state.Unigrid.MarkRow(other, false);
    MoveOut(state, state.Unigrid.PathOf(other), caption, failures);
  }
  return Load(state, clicked, caption, failures);
}

std::vector<std::string> ClickOther(LibraryState &state, int clicked, Caption &caption,
                                    Failures &failures) {
  const char letter = Letter(state.Unigrid.Row(clicked));
  if (IsLoaded(state.Unigrid.Row(clicked))) {
    Udel(state, clicked, caption, failures);
    if (letter == kFlightModelLetter) {
      state.Slots.rows.clear();
      state.Slots.frameVisible = false;
    }
    SaveLoaded(state, failures);
    return {};
  }
  const int other =
      AllowsSeveralLoaded(letter)
          ? -1
          : LastLoaded(state.Unigrid, FirstCharacterOf(state.Unigrid.Row(clicked).name).text);
  if (other >= 0) {
    if (letter == kFlightModelLetter)
      state.Slots.frameVisible = false;
    // Unmarked first, so that the record written by the unload no longer names it.
    state.Unigrid.MarkRow(other, false);
    MoveOut(state, state.Unigrid.PathOf(other), caption, failures);
  }
  const std::vector<std::string> overwritten = Load(state, clicked, caption, failures);
  if (letter == kFlightModelLetter) {
    GridSet(state.Slots, state.Unigrid.PathOf(clicked), failures);
    SaveLoaded(state, failures);
  }
  return overwritten;
}

} // namespace

namespace library {

std::vector<std::string> ClickRow(LibraryState &state, int row, Caption &caption,
                                  Failures &failures) {
  state.Unigrid.currentRow = row;
  if (!state.Unigrid.IsFolderRow(row))
    return {};
  // The game's place folders are found once for the whole click.
  const PlacesScope places(state);
  const GridRow &clicked = state.Unigrid.Row(row);
  if (!IsLoaded(clicked)) {
    const fs::path folder = state.Unigrid.PathOf(row);
    const bool found = FolderCheck(folder);
    // Windows lists a folder whose name it cannot keep, but finds no folder of that name.
    const std::string odd = WindowsNameProblem(clicked.name);
    if (!found && !odd.empty()) {
      failures.Add(folder, "cannot be loaded: it has " + odd);
      return {};
    }
    if (!found) {
      failures.Add(folder, "is no longer in the library, so nothing was loaded "
                           "(\"Refresh!\" shows the library as it is now)");
      return {};
    }
    // Loading makes the folder's files writable: never those of a folder elsewhere.
    if (RefusedForLink(state, folder, "nothing was loaded", failures))
      return {};
  } else if (RefusedForLink(state, {}, "nothing was unloaded", failures)) {
    return {};
  }
  if (Letter(clicked) == kCampaign)
    return ClickCampaign(state, row, caption, failures);
  return ClickOther(state, row, caption, failures);
}

} // namespace library
