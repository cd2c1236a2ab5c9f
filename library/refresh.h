#pragma once

#include "app/app_state.h"
#include "app/caption.h"
#include "app/failures.h"

// "Refresh!": rebuilds the folder grid from the library on disk and marks the recorded folders
// loaded again without touching a file. The category list and its selection are kept.
void Label33Click(AppState &state, Caption &caption, Failures &failures);
