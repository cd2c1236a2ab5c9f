#pragma once

#include "base/failures.h"
#include "library/library_state.h"

#include <filesystem>
#include <string>
#include <vector>

// The loaded-folders record "FoldersLoaded.txt" in the library.
std::filesystem::path RecordPath(const LibraryState &state);
// The record's bytes for the grid: each loaded name and CR LF, then one more CR LF.
std::string RecordText(const FolderGrid &grid);
// Rewrites the record from the grid's loaded rows, atomically.
void SaveLoaded(LibraryState &state, Failures &failures);
// The record's non-empty lines; a missing or unreadable record gives none.
std::vector<std::string> ReadLoadedNames(const LibraryState &state, Failures &failures);
// Adds `name` to the record on disk or takes it out, for an operation that was interrupted
// before the record followed it.
void SetRecorded(const LibraryState &state, const std::string &name, bool loaded,
                 Failures &failures);
// Creates the record as an empty file when it is missing.
void EnsureRecord(const LibraryState &state, Failures &failures);
