#include "library/refresh.h"

#include "app/category_file.h"
#include "app/startup.h"
#include "library/loaded_record.h"
#include "library/record_replay.h"

void Label33Click(AppState &state, Caption &caption, Failures &failures) {
  state.Ready = false;
  // Start-up writes both files when missing; a rebuild needs them just the same.
  EnsureCategoryFile(state.LibDir, failures);
  BuildGrid(state, failures);
  EnsureRecord(state, failures);
  ReplayRecord(state, caption, failures);
  // The rows under the pointer are other folders now, so the next move rebuilds the preview.
  state.HoverRow = -1;
  state.Ready = true;
}
