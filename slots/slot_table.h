#pragma once

#include <cstdint>
#include <string>
#include <vector>

// One plane-set folder in the slot grid.
struct SlotRow {
  std::string folder;
  std::string plnSlot;
  std::string skinSlot;
  std::string aircraft;
};

// The slot-grid panel `SlotFrame` with `SlotLabel` and `SlotGrid`.
struct SlotPanel {
  bool frameVisible = false;
  bool gridVisible = false;
  std::string label;
  int columns = 5;
  std::vector<SlotRow> rows;           // data rows; the header row is the window's
  std::uint32_t currentCellColour = 0; // the slot grid's default cell colour
};
