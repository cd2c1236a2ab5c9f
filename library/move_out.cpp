#include "library/move_out.h"

#include "base/file_ops.h"
#include "base/links.h"
#include "base/listing.h"
#include "base/names.h"
#include "library/keeping.h"
#include "library/loaded_record.h"
#include "library/save_files.h"
#include "library/unplace.h"

namespace fs = std::filesystem;

void MoveOut(LibraryState &state, const fs::path &folder, Caption &caption, Failures &failures) {
  if (IsCampaignFolder(folder) && IsLink(folder))
    RefuseLink(folder, "the saved games stay in Savedata", failures);
  else if (IsCampaignFolder(folder))
    CarrySaveFiles(state.EAWDir, folder, caption, failures);
  if (folder == state.EAWDir)
    return;
  CaptionRestorer restorer(caption);
  const fs::path keeping = KeepingFolder(state.LibDir);
  Ledger ledger = Ledger::Read(keeping, failures);
  // Before the journal is written, so that an earlier leftover taken out cannot look like one of
  // this folder's copies to a recovery.
  if (RetryLeftovers(state, ledger, caption, failures))
    ledger.Write(keeping, failures);
  const std::string name = NameText(folder);
  std::vector<PlacedFile> files;
  if (const LoadedFolder *loaded = ledger.Find(name))
    files = loaded->files;
  ledger.Remove(name);
  Journal journal{Journal::Step::Unload, name,
                  TakeOutEntries(files, ledger, KeptOriginals(keeping))};
  if (!journal.Write(keeping, failures)) {
    failures.Add(folder, "was not unloaded: the program cannot note what it is doing in " +
                             DisplayPath(keeping));
    return;
  }
  ledger.AddLeftovers(UnplaceFiles(state, ledger, journal.entries, false, caption, failures));
  ledger.Write(keeping, failures);
  SaveLoaded(state, failures);
  Journal::Remove(keeping);
}

void Udel(LibraryState &state, int row, Caption &caption, Failures &failures) {
  FolderGrid &grid = state.Unigrid;
  if (!grid.IsFolderRow(row))
    return;
  grid.MarkRow(row, false);
  const fs::path folder = grid.PathOf(row);
  MoveOut(state, folder, caption, failures);
}
