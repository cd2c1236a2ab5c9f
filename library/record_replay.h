#pragma once

#include "base/failures.h"
#include "library/library_state.h"

#include <string>
#include <vector>

// Marks the rows named in the loaded-folders record as loaded, touching no file and not writing
// the record: every recorded row ends marked, also two of a letter that allows one loaded folder,
// so that each can be unloaded. A recorded flight-model folder fills the slot panel as its click
// did, the last one recorded showing; the last recorded row becomes the current row.
void ReplayRecord(LibraryState &state, Failures &failures);
// The same with the record's non-empty lines already read.
void ReplayRecord(LibraryState &state, const std::vector<std::string> &lines, Failures &failures);
