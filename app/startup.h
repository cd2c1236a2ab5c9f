#pragma once

#include "app/app_state.h"
#include "app/caption.h"
#include "app/category_file.h"
#include "app/failures.h"

// Creates the library folder and the category file when missing and reads the categories into
// `List3` and `Codes`; returns the category lines that were skipped.
std::vector<SkippedLine> PrepareLibrary(AppState &state, Failures &failures);
// Fills the folder grid from the library folders, grouped by the category file's letters.
void BuildGrid(AppState &state, Failures &failures);
// The grid's height in twips: 20 rows at most, plus 72.
int GridHeightTwips(int rowCount);
