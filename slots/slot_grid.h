#pragma once

#include "base/failures.h"
#include "slots/slot_table.h"

#include <filesystem>
#include <string>
#include <vector>

// The slot panel's title: the flight-model folder's name and the names of the plane-set files
// its rows were read from ("F-Pack: planes.zep").
std::string SlotTitle(const std::string &folder, const std::vector<SlotRow> &rows);

// Fills the slot panel `slots` for the loaded flight-model folder `FMfolder` from its plane-set
// folders, in name order, and shows the panel; a folder without plane-set folders hides it and
// leaves the grid and its label as they were.
void GridSet(SlotPanel &slots, const std::filesystem::path &FMfolder, Failures &failures);
