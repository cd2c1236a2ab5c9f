#include "library/reset_all.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/file_remover.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/progress_meter.h"
#include "base/text_file.h"
#include "library/game_places.h"
#include "library/keeping.h"
#include "library/loaded_record.h"

namespace fs = std::filesystem;

static bool IsBlank(const std::string &line) {
  return line.find_first_not_of(" \t") == std::string::npos;
}

// Files the game itself keeps in its folder, whatever the patterns say.
static bool IsProtected(const std::string &name) {
  const std::string upper = Upper(name);
  return upper == "DSG.ICO" || upper == "EXTRA.SPT" || upper == "CHATLINE.TXT" ||
         upper == "HOF.DAT";
}

std::string CleanUpPatterns(const fs::path &libDir, Failures &failures) {
  // An empty list would delete nothing and a blank one is surely a slip: keep the default.
  const auto lines =
      ReadLinesIfExists(FindAnyCase(libDir, "CleanUp.ini"), failures, Encoding::Text);
  if (!lines || lines->empty() || IsBlank(lines->front()))
    return kDefaultCleanUpPatterns;
  return lines->front();
}

std::vector<std::string> CleanUpNames(const LibraryState &state, Failures &failures) {
  std::vector<std::string> names;
  for (std::string &name : ListFiles(state.EAWDir, CleanUpPatterns(state.LibDir, failures)))
    if (!IsProtected(name))
      names.push_back(std::move(name));
  return names;
}

int DeleteFiles(const fs::path &folder, const std::vector<std::string> &names, Caption &caption,
                Failures &failures) {
  FileRemover remover(folder);
  ProgressMeter meter(caption, static_cast<int>(names.size()));
  int deleted = 0;
  for (const std::string &name : names) {
    meter.NextFile("Please wait... cleaning up");
    deleted += remover.Remove(name, failures) ? 1 : 0;
  }
  return deleted;
}

void CleanUp(LibraryState &state, const std::vector<std::string> &names, Caption &caption,
             Failures &failures) {
  state.tally.removed += DeleteFiles(state.EAWDir, names, caption, failures);
}

void RestoreOriginals(LibraryState &state, Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  GamePlaces places(state.EAWDir);
  for (const Place place : {Place::Game, Place::Savedata, Place::Music}) {
    const fs::path kept = OriginalsFolder(keeping, place);
    for (const std::string &name : ListFiles(kept)) {
      const fs::path target = Child(places.Folder(place), name);
      // A saved game of that name is the player's progress since: both stay.
      FileCheck(target);
      if (IsSaveFile(name) && FileFound)
        continue;
      if (MoveReplacing(Child(kept, name), target, failures))
        ++state.tally.restored;
    }
  }
}

void FinishReset(LibraryState &state, Journal journal, Caption &caption, Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  if (journal.step == Journal::Step::Reset) {
    std::vector<std::string> names;
    for (const Journal::Entry &entry : journal.entries)
      names.push_back(entry.file.name);
    CleanUp(state, names, caption, failures);
    journal.step = Journal::Step::Restore;
    journal.entries.clear();
    journal.Write(keeping, failures);
  }
  RestoreOriginals(state, failures);
  Ledger().Write(keeping, failures);
  WriteAtomically(RecordPath(state), "", failures);
  Journal::Remove(keeping);
}

// The record is now empty, so no row may stay marked: a later click would write it back.
static void UnmarkAllRows(LibraryState &state) {
  for (size_t row = 1; row < state.Unigrid.rows.size(); ++row) {
    state.Unigrid.rows[row].mark.clear();
    state.Unigrid.rows[row].nameColour = state.GridBackColor;
  }
  state.Slots.frameVisible = false;
}

void ResetAll(LibraryState &state, const std::vector<std::string> &names, Caption &caption,
              Failures &failures) {
  {
    CaptionRestorer restorer(caption);
    state.Ready = true;
    caption.Set("Please wait... cleaning up");
    Journal journal{Journal::Step::Reset, "", {}};
    for (const std::string &name : names)
      journal.entries.push_back({{Place::Game, name}, false});
    if (journal.Write(KeepingFolder(state.LibDir), failures))
      FinishReset(state, std::move(journal), caption, failures);
    else
      failures.Add("Nothing was reset: the program cannot note what it is doing in " +
                   DisplayPath(KeepingFolder(state.LibDir)));
  }
  UnmarkAllRows(state);
  state.Ready = true;
}
