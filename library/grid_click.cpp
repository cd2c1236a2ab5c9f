#include "library/grid_click.h"

#include "library/loaded_record.h"
#include "library/move_in.h"
#include "library/move_out.h"
#include "slots/plane_set.h"
#include "slots/slot_grid.h"

namespace fs = std::filesystem;

namespace {

constexpr char kCampaign = 'C';
constexpr char kFlightModel = 'F';

void MarkLoaded(LibraryState &state, int row) {
  state.Unigrid.ColourRow(row, kLoadedColour);
  state.Unigrid.Row(row).mark = kLoadedMark;
}

void MarkNotLoaded(LibraryState &state, int row) {
  state.Unigrid.ColourRow(row, state.GridBackColor);
  state.Unigrid.Row(row).mark.clear();
}

// The first loaded row of `letter`, or 0.
int FirstLoaded(const FolderGrid &grid, char letter) {
  for (int row = 1; row < grid.RowCount(); ++row)
    if (IsLoaded(grid.Row(row)) && Letter(grid.Row(row)) == letter)
      return row;
  return 0;
}

// The last loaded row of `letter`, or 0.
int LastLoaded(const FolderGrid &grid, char letter) {
  for (int row = grid.RowCount() - 1; row >= 1; --row)
    if (IsLoaded(grid.Row(row)) && Letter(grid.Row(row)) == letter)
      return row;
  return 0;
}

// At most one campaign is loaded; loading another first unloads the loaded one, which carries
// the save files home into its folder.
void ClickCampaign(LibraryState &state, int clicked, Caption &caption, Failures &failures) {
  const fs::path folder = state.Unigrid.Row(clicked).path;
  if (IsLoaded(state.Unigrid.Row(clicked))) {
    MarkNotLoaded(state, clicked);
    MoveOut(state, folder, caption, failures);
    SaveLoaded(state, failures);
    return;
  }
  const int other = FirstLoaded(state.Unigrid, kCampaign);
  if (other != 0) {
    MarkNotLoaded(state, other);
    MoveOut(state, state.Unigrid.Row(other).path, caption, failures);
  }
  MarkLoaded(state, clicked);
  MoveIn(state, folder, caption, failures);
  SaveLoaded(state, failures);
}

void ShowPlaneSets(LibraryState &state, const fs::path &folder, Failures &failures) {
  const bool planeSetFound = !PlaneSetFolders(folder).empty();
  state.Slots.columns = kSlotColumns;
  if (planeSetFound)
    GridSet(state.Slots, state.GridBackColor, folder, failures);
  SaveLoaded(state, failures);
  state.Slots.frameVisible = planeSetFound;
}

void ClickOther(LibraryState &state, int clicked, Caption &caption, Failures &failures) {
  const char letter = Letter(state.Unigrid.Row(clicked));
  if (IsLoaded(state.Unigrid.Row(clicked))) {
    Udel(state, clicked, caption, failures);
    if (letter == kFlightModel) {
      state.Slots.rows.clear();
      state.Slots.frameVisible = false;
    }
    SaveLoaded(state, failures);
    return;
  }
  const int other = AllowsSeveralLoaded(letter) ? 0 : LastLoaded(state.Unigrid, letter);
  if (other != 0) {
    if (letter == kFlightModel)
      state.Slots.frameVisible = false;
    state.Unigrid.ColourRow(other, state.GridBackColor);
    MoveOut(state, state.Unigrid.Row(other).path, caption, failures);
    state.Unigrid.Row(other).mark.clear();
  }
  const fs::path folder = state.Unigrid.Row(clicked).path;
  MoveIn(state, folder, caption, failures);
  MarkLoaded(state, clicked);
  SaveLoaded(state, failures);
  if (letter == kFlightModel)
    ShowPlaneSets(state, folder, failures);
}

} // namespace

void ClickRow(LibraryState &state, int row, Caption &caption, Failures &failures) {
  state.Unigrid.currentRow = row;
  if (!state.Unigrid.IsFolderRow(row))
    return;
  if (Letter(state.Unigrid.Row(row)) == kCampaign)
    ClickCampaign(state, row, caption, failures);
  else
    ClickOther(state, row, caption, failures);
}

void PressKeyOnRow(LibraryState &state, int row, int key, Caption &caption, Failures &failures) {
  state.Unigrid.currentRow = row;
  if (key == kEnterKey)
    ClickRow(state, row, caption, failures);
}
