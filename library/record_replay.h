#pragma once

#include "app/app_state.h"
#include "app/caption.h"
#include "app/failures.h"

// Marks the rows named in the loaded-folders record as loaded, through the grid click with
// `Ready` false, so that no file is touched.
void ReplayRecord(AppState &state, Caption &caption, Failures &failures);
