#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

#include <string>
#include <vector>

namespace library {

// A click on grid row `row`, which becomes the current row: loads a folder that is not loaded,
// unloads one that is, keeping the campaign and single-selection rules, and drives the slot grid
// for flight-model folders. A click outside the grid's rows is ignored, and so is one on a folder
// that is no longer in the library (said in `failures`). Returns the loaded folders whose files
// the load replaced.
std::vector<std::string> ClickRow(LibraryState &state, int row, Caption &caption,
                                  Failures &failures);

} // namespace library
