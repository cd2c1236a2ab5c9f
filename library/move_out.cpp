#include "library/move_out.h"

#include "app/names.h"
#include "library/file_rules.h"
#include "library/game_places.h"
#include "library/listing.h"
#include "library/loaded_record.h"
#include "library/save_files.h"

#include <system_error>

namespace fs = std::filesystem;

static void DeleteCopies(const fs::path &eawDir, const fs::path &folder, Caption &caption,
                         Failures &failures) {
  CaptionRestorer restorer(caption);
  GamePlaces places(eawDir);
  for (const std::string &name : ListFiles(folder)) {
    // Save files stay: a campaign's have just been carried home, any other folder's are kept.
    if (StaysInLibrary(name) || IsSaveFile(name))
      continue;
    const Place place = PlaceOf(name);
    NameIndex &index = places.Index(place);
    const std::vector<std::string> &matches = index.Matches(name);
    if (matches.size() != 1)
      continue;
    const std::string found = matches.front();
    const fs::path target = Child(places.Folder(place), found);
    caption.Set("Deleting " + found);
    std::error_code error;
    fs::remove(target, error);
    if (error)
      failures.Add(target, "cannot be deleted (" + error.message() + ")");
    else
      index.Remove(found);
  }
}

void MoveOut(AppState &state, const fs::path &folder, Caption &caption, Failures &failures) {
  if (!state.Ready)
    return;
  if (IsCampaignPath(folder))
    CarrySaveFiles(state.EAWDir, folder, failures);
  if (folder == state.EAWDir)
    return;
  DeleteCopies(state.EAWDir, folder, caption, failures);
  SaveLoaded(state, failures);
}

void Udel(AppState &state, Caption &caption, Failures &failures) {
  FolderGrid &grid = state.Unigrid;
  if (state.ClickedRow < 1 || state.ClickedRow >= grid.RowCount())
    return;
  GridRow &row = grid.rows[static_cast<size_t>(state.ClickedRow)];
  row.mark.clear();
  grid.ColourRow(state.ClickedRow, state.GridBackColor);
  const fs::path folder = row.path;
  MoveOut(state, folder, caption, failures);
}
