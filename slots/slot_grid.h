#pragma once

#include "app/app_state.h"
#include "app/failures.h"

#include <filesystem>

// Fills the slot grid `state.Slots` from the plane-set folders of the flight-model folder
// `FMfolder`, in name order, and shows the grid. First takes `GridBackColor` from the slot
// grid's current cell; a folder without plane-set folders leaves the grid and its label as they
// were.
void GridSet(AppState &state, const std::filesystem::path &FMfolder, Failures &failures);
