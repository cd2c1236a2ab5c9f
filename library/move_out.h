#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

#include <filesystem>

// Unloads the add-on folder `folder`: for a campaign folder first carries the save files of
// "Savedata" into it, then deletes each copy that loading made, where loading put it, when
// exactly one file there has its name in any case, showing "Deleting NAME" in the caption; then
// rewrites the record. Does nothing while `Ready` is false, so that replaying the record never
// touches a file. A file that cannot be deleted is skipped and recorded in `failures`.
void MoveOut(LibraryState &state, const std::filesystem::path &folder, Caption &caption,
             Failures &failures);
// Unloads the folder of grid row `row`: clears its mark, colours it `GridBackColor`, MoveOut.
void Udel(LibraryState &state, int row, Caption &caption, Failures &failures);
