#include "library/recovery.h"

#include "base/file_ops.h"
#include "base/names.h"
#include "library/keeping.h"
#include "library/loaded_record.h"
#include "library/reset_all.h"
#include "library/save_files.h"
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
  RemoveHalfCarried(Child(state.LibDir, journal.folder));
  ledger.Write(keeping, failures);
  SetRecorded(state, journal.folder, false, failures);
}

void FinishInterrupted(LibraryState &state, Caption &caption, Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  RemovePartial(PartialPath(RecordPath(state)));
  std::optional<Journal> journal = Journal::Read(keeping, failures);
  if (!journal)
    return;
  CaptionRestorer restorer(caption);
  const ReadyGuard working(state, true);
  switch (journal->step) {
  case Journal::Step::Load:
  case Journal::Step::Unload:
    TakeOut(state, *journal, caption, failures);
    break;
  case Journal::Step::Loaded:
    SetRecorded(state, journal->folder, true, failures);
    break;
  case Journal::Step::Reset:
  case Journal::Step::Restore:
    FinishReset(state, std::move(*journal), true, caption, failures);
    break;
  }
  Journal::Remove(keeping);
}
