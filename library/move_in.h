#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

#include <filesystem>

// Loads the add-on folder `folder`: copies each of its files that does not stay in the library to
// the game folder, "Savedata" or "Music", replacing a file of that name, and shows each copied
// name in the caption. Does nothing while `Ready` is false or when `folder` is the game folder.
// A file that cannot be copied is skipped and recorded in `failures`.
void MoveIn(const LibraryState &state, const std::filesystem::path &folder, Caption &caption,
            Failures &failures);
