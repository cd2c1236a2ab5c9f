#include "library/ledger_check.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/text_encoding.h"
#include "base/text_file.h"
#include "library/file_rules.h"
#include "library/game_places.h"
#include "library/keeping.h"
#include "library/loaded_record.h"
#include "library/save_files.h"
#include "library/unplace.h"

#include <algorithm>
#include <set>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <utility>

namespace fs = std::filesystem;

namespace {

// The copies a folder loaded before the ledger made: its files found in the game in any case;
// two game files of one name are no copy of it.
LoadedFolder FoundCopies(const fs::path &eawDir, const fs::path &folder) {
  LoadedFolder loaded{NameText(folder), {}};
  const std::vector<std::string> names = ListFiles(folder);
  GamePlaces places(eawDir, names);
  for (const std::string &name : names) {
    if (StaysInLibrary(name) || IsSaveFile(name))
      continue;
    const Place place = PlaceOf(name);
    const std::vector<std::string> &matches = places.Index(place).Matches(name);
    if (matches.size() == 1)
      loaded.files.push_back({place, matches.front()});
  }
  return loaded;
}

Ledger LedgerFromRecord(const LibraryState &state, const std::vector<std::string> &recorded) {
  Ledger ledger;
  std::set<std::string> seen;
  for (const std::string &line : recorded) {
    // A record written in Windows-1252 names the folders that UTF-8 names differently.
    std::string name = NameFromText(line);
    bool found = FolderCheck(Child(state.LibDir, name));
    if (!found) {
      name = TextAsUtf8(line);
      found = FolderCheck(Child(state.LibDir, name));
    }
    if (found && seen.insert(name).second)
      ledger.Append(FoundCopies(state.EAWDir, Child(state.LibDir, name)));
  }
  return ledger;
}

std::string Quoted(const std::vector<std::string> &names) {
  std::string text;
  for (const std::string &name : names)
    text += (text.empty() ? "\"" : ", \"") + name + "\"";
  return text;
}

// Whether the record names the ledger's folders, no more and no fewer, each line as it is or, when
// the ledger has no such name, read as Windows-1252. Checked with the ledger's names hashed once
// and no copy of them: thousands are loaded in a large library.
bool RecordAgrees(const Ledger &ledger, const std::vector<std::string> &recorded) {
  std::unordered_map<std::string_view, bool> named;
  for (const LoadedFolder &folder : ledger.Folders())
    named.emplace(folder.name, false);
  size_t found = 0;
  for (const std::string &line : recorded) {
    auto entry = named.find(line);
    if (entry == named.end())
      entry = named.find(TextAsUtf8(line));
    if (entry == named.end())
      return false;
    found += !std::exchange(entry->second, true);
  }
  return found == named.size();
}

// Rewrites the record from the ledger where the two name different folders, and says what
// changed; `recorded` follows what the record holds.
void FollowLedger(const LibraryState &state, const Ledger &ledger,
                  std::vector<std::string> &recorded, Failures &failures) {
  if (RecordAgrees(ledger, recorded))
    return;
  std::vector<std::string> loaded;
  for (const LoadedFolder &folder : ledger.Folders())
    loaded.push_back(folder.name);
  const std::unordered_set<std::string> hashedLedger(loaded.begin(), loaded.end());
  std::unordered_set<std::string> hashedRecord;
  for (const std::string &line : recorded)
    hashedRecord.insert(hashedLedger.count(line) ? line : TextAsUtf8(line));
  const std::set<std::string> inLedger(loaded.begin(), loaded.end());
  const std::set<std::string> inRecord(hashedRecord.begin(), hashedRecord.end());
  std::vector<std::string> added, dropped;
  std::set_difference(inLedger.begin(), inLedger.end(), inRecord.begin(), inRecord.end(),
                      std::back_inserter(added));
  std::set_difference(inRecord.begin(), inRecord.end(), inLedger.begin(), inLedger.end(),
                      std::back_inserter(dropped));
  if (!WriteAtomically(RecordPath(state), JoinCrLf(loaded) + "\r\n", failures))
    return;
  loaded.erase(std::remove(loaded.begin(), loaded.end(), std::string()), loaded.end());
  recorded = std::move(loaded);
  std::string text = "The record of loaded folders did not agree with the files in the game, "
                     "and was mended:";
  if (!added.empty())
    text += " " + Quoted(added) + (added.size() == 1 ? " is" : " are") + " loaded.";
  if (!dropped.empty())
    text += " " + Quoted(dropped) + (dropped.size() == 1 ? " is" : " are") + " not loaded.";
  failures.Add(text);
}

} // namespace

std::vector<std::string> MendRecordFromLedger(LibraryState &state, Caption &caption,
                                              Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  std::vector<std::string> recorded = ReadLoadedNames(state, failures);
  if (!FolderCheck(keeping)) {
    if (recorded.empty())
      return recorded;
    const Ledger ledger = LedgerFromRecord(state, recorded);
    if (ledger.Write(keeping, failures))
      failures.Add("The folders recorded as loaded were loaded by an earlier version of the "
                   "program; each of their files found in the game is now taken for their copy.");
    FollowLedger(state, ledger, recorded, failures);
    return recorded;
  }
  Ledger ledger = Ledger::Read(keeping, failures);
  // A Reset All cut short while it carried a campaign's saved games home has no journal yet.
  for (const LoadedFolder &folder : ledger.Folders())
    if (IsCampaignName(folder.name))
      RemoveHalfCarried(Child(state.LibDir, folder.name));
  if (RetryLeftovers(state, ledger, caption, failures))
    ledger.Write(keeping, failures);
  FollowLedger(state, ledger, recorded, failures);
  return recorded;
}
