#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

// Marks the rows named in the loaded-folders record as loaded, through the grid click with
// `Ready` false, so that no file is touched; every recorded row ends marked, also two of a letter
// that allows one loaded folder.
void ReplayRecord(LibraryState &state, Caption &caption, Failures &failures);
