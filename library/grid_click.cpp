#include "library/grid_click.h"

#include "library/loaded_record.h"

void UnigridClick(AppState &state, Caption &, Failures &failures) {
  FolderGrid &grid = state.Unigrid;
  if (grid.currentRow < 1 || grid.currentRow >= grid.RowCount())
    return;
  state.ClickedRow = grid.currentRow;
  GridRow &row = grid.rows[static_cast<size_t>(state.ClickedRow)];
  if (row.mark == "S") {
    row.mark.clear();
    grid.ColourRow(state.ClickedRow, state.GridBackColor);
  } else {
    grid.ColourRow(state.ClickedRow, kLoadedColour);
    row.mark = "S";
  }
  SaveLoaded(state, failures);
}
