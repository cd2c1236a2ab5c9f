#pragma once

#include "app/app_state.h"
#include "app/caption.h"
#include "app/failures.h"

// The key code of Enter.
inline constexpr int kEnterKey = 13;

// A click on the grid's current row: loads a folder that is not loaded, unloads one that is,
// keeping the campaign and single-selection rules, and drives the slot grid for flight-model
// folders. A click on the header row or on an empty grid is ignored. While `Ready` is false it
// only marks and colours rows: no file is copied, deleted or moved.
void UnigridClick(AppState &state, Caption &caption, Failures &failures);
// A key pressed on the grid: Enter acts as a click on the current row, other keys do nothing.
void UnigridKeyPress(AppState &state, int key, Caption &caption, Failures &failures);
