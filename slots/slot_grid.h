#pragma once

#include "base/failures.h"
#include "slots/slot_table.h"

#include <cstdint>
#include <filesystem>

// Fills the slot grid `slots` from the plane-set folders of the flight-model folder `FMfolder`,
// in name order, and shows the grid. First takes `GridBackColor` from the slot grid's current
// cell; a folder without plane-set folders leaves the grid and its label as they were.
void GridSet(SlotPanel &slots, std::uint32_t &GridBackColor, const std::filesystem::path &FMfolder,
             Failures &failures);
