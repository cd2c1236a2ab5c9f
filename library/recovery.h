#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"

// Ends what an operation interrupted by a crash or a power cut left half done, as the journal in
// the keeping folder tells: a load is rolled back, an unload and a Reset All are finished, and
// the ledger and the record are made to agree with the game folder. Temporary files the
// operation left are removed. Does nothing when no operation was interrupted.
void FinishInterrupted(LibraryState &state, Caption &caption, Failures &failures);
