#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/keeping.h"
#include "library/library_state.h"

#include <string>
#include <unordered_set>
#include <vector>

// The kept originals of the keeping folder `keeping`, by PlaceKey, listed once.
std::unordered_set<std::string> KeptOriginals(const std::filesystem::path &keeping);
// The journal entries that take `files` out of the game while the folders of `ledger` stay
// loaded: an entry is marked to put the original back where no folder of `ledger` provides the
// name and an original is kept, so that the step means the same when it is done again.
std::vector<Journal::Entry> TakeOutEntries(const std::vector<PlacedFile> &files,
                                           const Ledger &ledger,
                                           const std::unordered_set<std::string> &kept);
// Takes files that a folder put into the game out again. An entry marked keepOriginal gets the
// kept original back, and stays as it is while none is kept (then it is the original, already
// back or never gone). Any other entry is replaced by the copy of the folder still loaded in
// `ledger` that was loaded last and provides that name, else by a kept original, else deleted.
// Save files stay. Doing it again after a crash does no harm; `afterCrash` also removes the
// temporary copies the interrupted work may have left. Returns the copies that could not be
// taken out, which the caller notes in the ledger as leftovers.
std::vector<FileStep> UnplaceFiles(LibraryState &state, const Ledger &ledger,
                                   const std::vector<Journal::Entry> &entries, bool afterCrash,
                                   Caption &caption, Failures &failures);
// Tries again to take out the ledger's leftover copies; those a loaded folder now provides are
// dropped. Returns whether the ledger changed; the caller writes it. Doing it again after a crash
// does no harm, as each leftover notes whether its original comes back.
bool RetryLeftovers(LibraryState &state, Ledger &ledger, Caption &caption, Failures &failures);
