#include "library/unplace.h"

#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/progress_meter.h"
#include "library/game_places.h"

#include <system_error>

namespace fs = std::filesystem;

std::unordered_set<std::string> KeptOriginals(const fs::path &keeping) {
  std::unordered_set<std::string> kept;
  for (const Place place : {Place::Game, Place::Savedata, Place::Music})
    ForEachFile(
        OriginalsFolder(keeping, place),
        [&](std::string &&name) { kept.insert(PlaceKey(place, name)); }, FileKinds::WithHidden);
  return kept;
}

std::vector<Journal::Entry> TakeOutEntries(const std::vector<PlacedFile> &files,
                                           const Ledger &ledger,
                                           const std::unordered_set<std::string> &kept) {
  const auto providers = ledger.LastProviders();
  std::vector<Journal::Entry> entries;
  for (const PlacedFile &file : files) {
    const std::string key = PlaceKey(file.place, file.name);
    entries.push_back({file, providers.count(key) == 0 && kept.count(key) > 0});
  }
  return entries;
}

// Whether an entry of that name is still in `folder`, without following a link.
static bool StillThere(const fs::path &folder, const std::string &name) {
  std::error_code error;
  return fs::exists(fs::symlink_status(Child(folder, name), error));
}
std::vector<FileStep> UnplaceFiles(LibraryState &state, const Ledger &ledger,
                                   const std::vector<Journal::Entry> &entries, bool afterCrash,
                                   Caption &caption, Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  const OriginalsFolders originals = AllOriginalsFolders(keeping);
  const auto providers = ledger.LastProviders();
  const std::unordered_set<std::string> kept = KeptOriginals(keeping);
  GamePlaces places(PlaceFoldersOf(state));
  std::vector<FileStep> leftovers;
  ProgressMeter meter(caption, static_cast<int>(entries.size()));
  for (const Journal::Entry &entry : entries) {
    const PlacedFile &file = entry.file;
    const std::string key = PlaceKey(file.place, file.name);
    const bool originalKept = kept.count(key) > 0;
    const auto provider = entry.keepOriginal ? providers.end() : providers.find(key);
    meter.NextFile(provider != providers.end() || originalKept ? "Please wait- copying: :"
                                                               : "Deleting ",
                   file.name);
    if (IsSaveFile(file.name))
      continue;
    const fs::path &folder = places.Folder(file.place);
    if (afterCrash)
      RemovePartial(PartialPath(Child(folder, file.name)));
    if (provider != providers.end()) {
      if (CopyReplacing(FindAnyCase(Child(state.LibDir, provider->second), file.name),
                        Child(folder, file.name), failures))
        ++state.tally.restored;
    } else if (originalKept) {
      if (MoveReplacing(Child(originals[static_cast<size_t>(file.place)], file.name),
                        Child(folder, file.name), failures))
        ++state.tally.restored;
      else
        leftovers.push_back({file, true});
    } else if (!entry.keepOriginal) {
      if (places.Remover(file.place).Remove(file.name, failures))
        ++state.tally.removed;
      else if (StillThere(folder, file.name))
        leftovers.push_back({file, false});
    }
  }
  return leftovers;
}

bool RetryLeftovers(LibraryState &state, Ledger &ledger, Caption &caption, Failures &failures) {
  if (ledger.Leftovers().empty())
    return false;
  const auto providers = ledger.LastProviders();
  std::vector<FileStep> entries;
  for (const FileStep &leftover : ledger.Leftovers())
    if (providers.count(PlaceKey(leftover.file.place, leftover.file.name)) == 0)
      entries.push_back(leftover);
  ledger.SetLeftovers(UnplaceFiles(state, Ledger(), entries, false, caption, failures));
  return true;
}
