#include "library/move_out.h"

#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "library/file_rules.h"
#include "library/game_places.h"
#include "library/loaded_record.h"
#include "library/save_files.h"

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
    if (RemoveFile(target, failures))
      index.Remove(found);
  }
}

void MoveOut(LibraryState &state, const fs::path &folder, Caption &caption, Failures &failures) {
  if (!state.Ready)
    return;
  if (IsCampaignPath(folder))
    CarrySaveFiles(state.EAWDir, folder, failures);
  if (folder == state.EAWDir)
    return;
  DeleteCopies(state.EAWDir, folder, caption, failures);
  SaveLoaded(state, failures);
}

void Udel(LibraryState &state, int row, Caption &caption, Failures &failures) {
  FolderGrid &grid = state.Unigrid;
  if (!grid.IsFolderRow(row))
    return;
  grid.Row(row).mark.clear();
  grid.ColourRow(row, state.GridBackColor);
  const fs::path folder = grid.Row(row).path;
  MoveOut(state, folder, caption, failures);
}
