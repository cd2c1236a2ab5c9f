#include "library/reset_all.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/text_file.h"
#include "library/game_places.h"
#include "library/keeping.h"
#include "library/kept_links.h"
#include "library/loaded_record.h"
#include "library/save_files.h"
#include "library/unplace.h"

#include <unordered_set>

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

// The game-folder names the ledger lists, folded: an unload takes those out.
static std::unordered_set<std::string> LedgerGameNames(const Ledger &ledger) {
  std::unordered_set<std::string> names;
  for (const LoadedFolder &folder : ledger.Folders())
    for (const PlacedFile &file : folder.files)
      if (file.place == Place::Game)
        names.insert(FoldName(file.name));
  for (const FileStep &leftover : ledger.Leftovers())
    if (leftover.file.place == Place::Game)
      names.insert(FoldName(leftover.file.name));
  return names;
}

std::vector<std::string> CleanUpNames(const LibraryState &state, Failures &failures) {
  const std::unordered_set<std::string> loaded =
      LedgerGameNames(Ledger::Read(KeepingFolder(state.LibDir), failures));
  std::vector<std::string> names;
  for (std::string &name : ListFiles(state.EAWDir, CleanUpPatterns(state.LibDir, failures)))
    if (!IsProtected(name) && loaded.count(FoldName(name)) == 0)
      names.push_back(std::move(name));
  return names;
}

int LoadedFileCount(const LibraryState &state, Failures &failures) {
  const Ledger ledger = Ledger::Read(KeepingFolder(state.LibDir), failures);
  std::unordered_set<std::string> keys;
  for (const LoadedFolder &folder : ledger.Folders())
    for (const PlacedFile &file : folder.files)
      if (!IsSaveFile(file.name))
        keys.insert(PlaceKey(file.place, file.name));
  for (const FileStep &leftover : ledger.Leftovers())
    keys.insert(PlaceKey(leftover.file.place, leftover.file.name));
  return static_cast<int>(keys.size());
}

void RestoreOriginals(LibraryState &state, Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  GamePlaces places(PlaceFoldersOf(state));
  for (const Place place : {Place::Game, Place::Savedata, Place::Music}) {
    const fs::path kept = OriginalsFolder(keeping, place);
    for (const std::string &name : ListFiles(kept, "*.*", FileKinds::WithHidden)) {
      const fs::path target = Child(places.Folder(place), name);
      // A saved game of that name is the player's progress since: both stay.
      if (IsSaveFile(name) && FileCheck(target))
        continue;
      if (MoveReplacing(Child(kept, name), target, failures))
        ++state.tally.restored;
    }
  }
}

void FinishReset(LibraryState &state, Journal journal, bool afterCrash, Caption &caption,
                 Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  // No folder stays loaded, so each copy goes and each kept original comes back.
  Ledger none;
  if (journal.step == Journal::Step::Reset)
    none.SetLeftovers(
        UnplaceFiles(state, Ledger(), journal.entries, afterCrash, caption, failures));
  else
    none.SetLeftovers(Ledger::Read(keeping, failures).Leftovers());
  none.Write(keeping, failures);
  WriteAtomically(RecordPath(state), "", failures);
  if (journal.step == Journal::Step::Reset) {
    journal.step = Journal::Step::Restore;
    journal.entries.clear();
    journal.Write(keeping, failures);
  }
  RestoreOriginals(state, failures);
  Journal::Remove(keeping);
}

// The journal of a Reset All: every file of the loaded folders and every leftover copy, each
// once, then the other files `names` the player agreed to.
static Journal ResetJournal(const LibraryState &state, const Ledger &ledger,
                            const std::vector<std::string> &names) {
  std::vector<PlacedFile> files;
  std::unordered_set<std::string> keys;
  const auto add = [&](const PlacedFile &file) {
    if (keys.insert(PlaceKey(file.place, file.name)).second)
      files.push_back(file);
  };
  for (const LoadedFolder &folder : ledger.Folders())
    for (const PlacedFile &file : folder.files)
      add(file);
  Journal journal{Journal::Step::Reset, "", {}};
  for (const FileStep &leftover : ledger.Leftovers())
    if (keys.insert(PlaceKey(leftover.file.place, leftover.file.name)).second)
      journal.entries.push_back(leftover);
  for (const std::string &name : names)
    add({Place::Game, name});
  for (FileStep &entry :
       TakeOutEntries(files, Ledger(), KeptOriginals(KeepingFolder(state.LibDir))))
    journal.entries.push_back(std::move(entry));
  return journal;
}

// The record is now empty, so no row may stay marked: a later click would write it back.
static void UnmarkAllRows(LibraryState &state) {
  for (GridRow &row : state.Unigrid.rows)
    row.loaded = false;
  state.Slots.frameVisible = false;
}

void ResetAll(LibraryState &state, const std::vector<std::string> &names, Caption &caption,
              Failures &failures) {
  const PlacesScope places(state);
  if (RefusedForLink(state, {}, "nothing was reset", failures))
    return;
  {
    CaptionRestorer restorer(caption);
    caption.Set("Please wait... cleaning up");
    const Ledger ledger = Ledger::Read(KeepingFolder(state.LibDir), failures);
    // The save files of a loaded campaign go home first, as its unload would carry them.
    for (const LoadedFolder &folder : ledger.Folders())
      if (IsCampaignFolder(Child(state.LibDir, folder.name)))
        CarrySaveFiles(state.EAWDir, Child(state.LibDir, folder.name), caption, failures);
    Journal journal = ResetJournal(state, ledger, names);
    if (journal.Write(KeepingFolder(state.LibDir), failures))
      FinishReset(state, std::move(journal), false, caption, failures);
    else
      failures.Add("Nothing was reset: the program cannot note what it is doing in " +
                   DisplayPath(KeepingFolder(state.LibDir)));
  }
  UnmarkAllRows(state);
}
