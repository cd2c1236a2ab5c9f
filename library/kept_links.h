#pragma once

#include "base/failures.h"
#include "library/library_state.h"

#include <filesystem>
#include <string>

// Whether an operation must be refused because a folder it writes through is a link: the keeping
// folder, its originals and their place folders, "Savedata", "Music", and `addon` when given.
// When so, `failures` names the first such link, why, and `consequence` ("nothing was loaded").
bool RefusedForLink(const LibraryState &state, const std::filesystem::path &addon,
                    const std::string &consequence, Failures &failures);
