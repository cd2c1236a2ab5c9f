#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

#include <filesystem>

// Unloads the add-on folder `folder`: for a campaign folder first carries the save files of
// "Savedata" into it, then takes out each file that loading put into the game as the ledger
// lists them, showing "Deleting NAME" in the caption. A file another loaded folder also
// provides gets that folder's copy back, and a replaced original of the game comes back; then
// the ledger and the record are rewritten. A file that cannot be deleted is recorded in `failures`
// and stays in the ledger as a leftover, tried again at the next unload, Reset All and start.
void MoveOut(LibraryState &state, const std::filesystem::path &folder, Caption &caption,
             Failures &failures);
// Unloads the folder of grid row `row`: marks it not loaded, then MoveOut.
void Udel(LibraryState &state, int row, Caption &caption, Failures &failures);
