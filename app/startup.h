#pragma once

#include "app/category_file.h"
#include "app/selector_state.h"
#include "base/failures.h"

#include <string>
#include <vector>

// Creates the library folder and the category file when missing and reads the categories into
// `List3` and `Codes`; returns the category lines that were skipped.
std::vector<SkippedLine> PrepareLibrary(SelectorState &state, Failures &failures);
// Fills the folder grid from the library folders, grouped by the category letters `codes`.
void BuildGrid(LibraryState &state, const std::vector<std::string> &codes);
// The picture file `name` of the game folder, whatever its letter case; empty when there is none.
std::filesystem::path GamePicture(const std::filesystem::path &eawDir, const char *name);
