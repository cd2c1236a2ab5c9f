#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

#include <string>
#include <vector>

// Makes the record of loaded folders agree with the ledger at start-up, the ledger being the
// truth of what is in the game. A record from before the ledger was kept (folders recorded
// loaded, no keeping folder) first gives the ledger: each file of a recorded folder found in the
// game counts as its copy. Leftover copies are tried again, and the temporary copies of saved
// games that a Reset All cut short left in a loaded campaign folder are removed. What was mended is
// said in `failures`, once. Returns the record's non-empty lines as they now stand.
std::vector<std::string> MendRecordFromLedger(LibraryState &state, Caption &caption,
                                              Failures &failures);
