#include "library/recovery.h"

#include "base/file_ops.h"
#include "base/links.h"
#include "base/listing.h"
#include "base/names.h"
#include "library/keeping.h"
#include "library/kept_links.h"
#include "library/loaded_record.h"
#include "library/reset_all.h"
#include "library/save_files.h"
#include "library/setups.h"
#include "library/unplace.h"

namespace fs = std::filesystem;

// Takes the journal's folder out of the game, the ledger and the record: the rollback of a load
// and the end of an unload are the same work.
static void TakeOut(LibraryState &state, const Journal &journal, Caption &caption,
                    Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  Ledger ledger = Ledger::Read(keeping, failures);
  ledger.Remove(journal.folder);
  ledger.AddLeftovers(UnplaceFiles(state, ledger, journal.entries, true, caption, failures));
  // A save file carried home into a campaign folder may have been half copied.
  const fs::path folder = Child(state.LibDir, journal.folder);
  if (!journal.folder.empty() && !IsLink(folder))
    RemoveHalfCarried(folder);
  ledger.Write(keeping, failures);
  SetRecorded(state, journal.folder, false, failures);
}

void FinishInterrupted(LibraryState &state, Caption &caption, Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  RemovePartial(PartialPath(RecordPath(state)));
  RemoveHalfWrittenSetups(state.LibDir);
  if (Journal::Pending(keeping) &&
      RefusedForLink(state, {}, "the operation cut short was not finished", failures))
    return;
  std::optional<Journal> journal = Journal::Read(keeping, failures);
  if (!journal)
    return;
  CaptionRestorer restorer(caption);
  switch (journal->step) {
  case Journal::Step::Load:
  case Journal::Step::Unload:
    TakeOut(state, *journal, caption, failures);
    break;
  case Journal::Step::Loaded:
    if (!journal->folder.empty())
      SetRecorded(state, journal->folder, true, failures);
    break;
  case Journal::Step::Reset:
  case Journal::Step::Restore:
    FinishReset(state, std::move(*journal), true, caption, failures);
    break;
  }
  Journal::Remove(keeping);
}
