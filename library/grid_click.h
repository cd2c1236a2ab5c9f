#pragma once

#include "app/app_state.h"
#include "app/caption.h"
#include "app/failures.h"

// A click on the grid's current row: loads a folder that is not loaded, unloads one that is,
// keeping the campaign and single-selection rules. While `Ready` is false it only marks rows.
void UnigridClick(AppState &state, Caption &caption, Failures &failures);
