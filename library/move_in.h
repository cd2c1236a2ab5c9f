#pragma once

#include "app/app_state.h"
#include "app/caption.h"
#include "app/failures.h"

#include <filesystem>

// Loads the add-on folder `folder`: copies each of its files that does not stay in the library to
// the game folder, "Savedata" or "Music", replacing a file of that name, and shows each copied
// name in the caption. Does nothing while `Ready` is false or when `folder` is the game folder.
// A file that cannot be copied is skipped and recorded in `failures`.
void MoveIn(const AppState &state, const std::filesystem::path &folder, Caption &caption,
            Failures &failures);
