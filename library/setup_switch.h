#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

#include <string>
#include <vector>

// The loaded folders in the order they were loaded: those the ledger lists, then the other
// loaded rows (loaded before the ledger was kept) in grid order.
std::vector<std::string> LoadedInOrder(const LibraryState &state, Failures &failures);

// What a switch did, beyond the tally of files.
struct SwitchResult {
  int unloaded = 0;
  int loaded = 0;
  std::vector<std::string> notices; // folders the category rules left out
};

// Makes `folders` the loaded folders, loaded in that order, as clicks on their rows would: a
// loaded folder the list does not hold is unloaded (the last loaded first), and so is one loaded
// out of the list's order together with those after it; then the rest are loaded in order. Of
// several folders of a letter that allows one loaded folder, the last is loaded and the notices
// say so. A name that is no folder of the library is said in `failures`, and the rest are loaded.
SwitchResult SwitchToFolders(LibraryState &state, const std::vector<std::string> &folders,
                             Caption &caption, Failures &failures);
