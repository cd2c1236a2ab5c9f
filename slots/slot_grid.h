#pragma once

#include "base/failures.h"
#include "slots/slot_table.h"

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

// The slot panel's title: the flight-model folder's name and the names of the plane-set files
// its rows were read from ("F-Pack: planes.zep").
std::string SlotTitle(const std::string &folder, const std::vector<SlotRow> &rows);

// Fills the slot grid `slots` from the plane-set folders of the flight-model folder `FMfolder`,
// in name order, and shows the grid. First takes `GridBackColor` from the slot grid's current
// cell; a folder without plane-set folders leaves the grid and its label as they were.
void GridSet(SlotPanel &slots, std::uint32_t &GridBackColor, const std::filesystem::path &FMfolder,
             Failures &failures);
