#include "library/move_out.h"

#include "base/file_ops.h"
#include "base/links.h"
#include "base/listing.h"
#include "base/names.h"
#include "library/file_rules.h"
#include "library/game_places.h"
#include "library/keeping.h"
#include "library/loaded_record.h"
#include "library/save_files.h"
#include "library/unplace.h"

namespace fs = std::filesystem;

// The copies that a folder loaded before the ledger was kept made: its files now, where exactly
// one game file has the name in any case.
static std::vector<Journal::Entry> ListedCopies(const fs::path &eawDir, const fs::path &folder) {
  std::vector<Journal::Entry> entries;
  const std::vector<std::string> names = ListFiles(folder);
  GamePlaces places(eawDir, names);
  for (const std::string &name : names) {
    if (StaysInLibrary(name) || IsSaveFile(name))
      continue;
    const Place place = PlaceOf(name);
    const std::vector<std::string> &matches = places.Index(place).Matches(name);
    if (matches.size() == 1)
      entries.push_back({{place, matches.front()}, false});
  }
  return entries;
}

void MoveOut(LibraryState &state, const fs::path &folder, Caption &caption, Failures &failures) {
  if (!state.Ready)
    return;
  if (IsCampaignFolder(folder) && IsLink(folder))
    RefuseLink(folder, "the saved games stay in Savedata", failures);
  else if (IsCampaignFolder(folder))
    CarrySaveFiles(state.EAWDir, folder, caption, failures);
  if (folder == state.EAWDir)
    return;
  CaptionRestorer restorer(caption);
  const fs::path keeping = KeepingFolder(state.LibDir);
  Ledger ledger = Ledger::Read(keeping, failures);
  const std::string name = NameText(folder);
  Journal journal{Journal::Step::Unload, name, {}};
  if (const LoadedFolder *loaded = ledger.Find(name))
    for (const PlacedFile &file : loaded->files)
      journal.entries.push_back({file, false});
  else
    journal.entries = ListedCopies(state.EAWDir, folder);
  ledger.Remove(name);
  if (!journal.Write(keeping, failures)) {
    failures.Add(folder, "was not unloaded: the program cannot note what it is doing in " +
                             DisplayPath(keeping));
    return;
  }
  UnplaceFiles(state, ledger, journal.entries, false, caption, failures);
  ledger.Write(keeping, failures);
  SaveLoaded(state, failures);
  Journal::Remove(keeping);
}

void Udel(LibraryState &state, int row, Caption &caption, Failures &failures) {
  FolderGrid &grid = state.Unigrid;
  if (!grid.IsFolderRow(row))
    return;
  grid.Row(row).mark.clear();
  grid.ColourRow(row, state.GridBackColor);
  const fs::path folder = grid.PathOf(row);
  MoveOut(state, folder, caption, failures);
}
