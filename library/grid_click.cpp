#include "library/grid_click.h"

#include "library/loaded_record.h"
#include "library/move_in.h"
#include "library/move_out.h"
#include "slots/plane_set.h"
#include "slots/slot_grid.h"

#include <string_view>

namespace fs = std::filesystem;

namespace {

constexpr char kCampaign = 'C';
constexpr char kFlightModel = 'F';

GridRow &RowAt(AppState &state, int row) { return state.Unigrid.rows[static_cast<size_t>(row)]; }

char Letter(const GridRow &row) { return row.name.empty() ? '\0' : row.name.front(); }

bool AllowsMany(char letter) {
  return letter != '\0' && std::string_view("GXYZNK").find(letter) != std::string_view::npos;
}

bool IsLoaded(const GridRow &row) { return row.mark == "S"; }

void MarkLoaded(AppState &state, int row) {
  state.Unigrid.ColourRow(row, kLoadedColour);
  RowAt(state, row).mark = "S";
}

void MarkNotLoaded(AppState &state, int row) {
  state.Unigrid.ColourRow(row, state.GridBackColor);
  RowAt(state, row).mark.clear();
}

// The first loaded row of `letter`, or 0.
int FirstLoaded(const FolderGrid &grid, char letter) {
  for (int row = 1; row < grid.RowCount(); ++row) {
    const GridRow &r = grid.rows[static_cast<size_t>(row)];
    if (IsLoaded(r) && Letter(r) == letter)
      return row;
  }
  return 0;
}

// The last loaded row of `letter`, or 0.
int LastLoaded(const FolderGrid &grid, char letter) {
  for (int row = grid.RowCount() - 1; row >= 1; --row) {
    const GridRow &r = grid.rows[static_cast<size_t>(row)];
    if (IsLoaded(r) && Letter(r) == letter)
      return row;
  }
  return 0;
}

// At most one campaign is loaded; loading another first unloads the loaded one, which carries
// the save files home into its folder.
void ClickCampaign(AppState &state, Caption &caption, Failures &failures) {
  const int clicked = state.ClickedRow;
  if (IsLoaded(RowAt(state, clicked))) {
    MarkNotLoaded(state, clicked);
    MoveOut(state, RowAt(state, clicked).path, caption, failures);
    SaveLoaded(state, failures);
    return;
  }
  state.OtherRow = FirstLoaded(state.Unigrid, kCampaign);
  if (state.OtherRow != 0) {
    MarkNotLoaded(state, state.OtherRow);
    MoveOut(state, RowAt(state, state.OtherRow).path, caption, failures);
  }
  MarkLoaded(state, clicked);
  MoveIn(state, RowAt(state, clicked).path, caption, failures);
  SaveLoaded(state, failures);
}

void ShowPlaneSets(AppState &state, const fs::path &folder, Failures &failures) {
  state.PlaneSetFound = !PlaneSetFolders(folder).empty();
  state.Slots.columns = kSlotColumns;
  if (state.PlaneSetFound)
    GridSet(state, folder, failures);
  SaveLoaded(state, failures);
  state.Slots.frameVisible = state.PlaneSetFound;
}

void ClickOther(AppState &state, Caption &caption, Failures &failures) {
  const int clicked = state.ClickedRow;
  const char letter = Letter(RowAt(state, clicked));
  if (IsLoaded(RowAt(state, clicked))) {
    Udel(state, caption, failures);
    if (letter == kFlightModel) {
      state.Slots.rows.clear();
      state.Slots.frameVisible = false;
    }
    SaveLoaded(state, failures);
    return;
  }
  state.OtherRow = AllowsMany(letter) ? 0 : LastLoaded(state.Unigrid, letter);
  if (state.OtherRow != 0) {
    if (letter == kFlightModel)
      state.Slots.frameVisible = false;
    state.Unigrid.ColourRow(state.OtherRow, state.GridBackColor);
    MoveOut(state, RowAt(state, state.OtherRow).path, caption, failures);
    RowAt(state, state.OtherRow).mark.clear();
  }
  MoveIn(state, RowAt(state, clicked).path, caption, failures);
  MarkLoaded(state, clicked);
  SaveLoaded(state, failures);
  if (letter == kFlightModel)
    ShowPlaneSets(state, RowAt(state, clicked).path, failures);
}

} // namespace

void UnigridClick(AppState &state, Caption &caption, Failures &failures) {
  const FolderGrid &grid = state.Unigrid;
  if (grid.currentRow < 1 || grid.currentRow >= grid.RowCount())
    return;
  state.ClickedRow = grid.currentRow;
  if (Letter(RowAt(state, state.ClickedRow)) == kCampaign)
    ClickCampaign(state, caption, failures);
  else
    ClickOther(state, caption, failures);
}

void UnigridKeyPress(AppState &state, int key, Caption &caption, Failures &failures) {
  if (key == kEnterKey)
    UnigridClick(state, caption, failures);
}
