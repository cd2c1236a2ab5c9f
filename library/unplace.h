#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/keeping.h"
#include "library/library_state.h"

#include <vector>

// Takes files that a folder put into the game out again: each is replaced by the copy of the
// folder still loaded in `ledger` that was loaded last and provides that name, else by the
// game's kept original, else deleted. Save files stay. An entry whose original is to be kept but
// is not in the keeping folder yet is still the original and stays too. After a crash,
// `afterCrash` also removes the temporary copies the interrupted work may have left.
void UnplaceFiles(LibraryState &state, const Ledger &ledger,
                  const std::vector<Journal::Entry> &entries, bool afterCrash, Caption &caption,
                  Failures &failures);
