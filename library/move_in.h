#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

// Loads the add-on folder `folder`: copies each of its files that does not stay in the library to
// the game folder, "Savedata" or "Music", replacing a file of that name, and shows each copied
// name in the caption. A game file that no loaded folder put there is first moved into the
// keeping folder, to be put back when the last folder providing its name is unloaded; where one
// is kept already, the game's file is not replaced. When a copy fails after its original was
// kept, the original goes back at once. The
// journal is left at "loaded" for the caller to close once the record is written. Does nothing
// when `folder` is the game folder. A file that cannot be copied is
// skipped and recorded in `failures`. Returns the loaded folders whose files it replaced; nothing,
// with the reason in `failures`, when the folder was not loaded at all (it cannot be listed, or
// the journal cannot be written).
std::optional<std::vector<std::string>> MoveIn(LibraryState &state,
                                               const std::filesystem::path &folder,
                                               Caption &caption, Failures &failures);
