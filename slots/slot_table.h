#pragma once

#include <string>
#include <vector>

// Columns of the slot grid: Folder, PlnSlot, SkinSlot, Aircraft and one empty column.
inline constexpr int kSlotColumns = 5;

// One plane-set folder in the slot grid.
struct SlotRow {
  std::string folder;
  std::string plnSlot;
  std::string skinSlot;
  std::string aircraft;
  std::string file; // the plane-set file the row was read from; empty for none
};

// The slot-grid panel `SlotFrame` with `SlotLabel` and `SlotGrid`.
struct SlotPanel {
  bool frameVisible = false;
  bool gridVisible = false;
  std::string label;
  int columns = kSlotColumns;
  std::vector<SlotRow> rows; // data rows; the header row is the window's
};
