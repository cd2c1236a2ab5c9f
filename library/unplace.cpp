#include "library/unplace.h"

#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/progress_meter.h"
#include "library/game_places.h"

#include <unordered_set>

namespace fs = std::filesystem;

// The kept originals by PlaceKey, listed once.
static std::unordered_set<std::string> KeptOriginals(const fs::path &keeping) {
  std::unordered_set<std::string> kept;
  for (const Place place : {Place::Game, Place::Savedata, Place::Music})
    for (const std::string &name : ListFiles(OriginalsFolder(keeping, place)))
      kept.insert(PlaceKey(place, name));
  return kept;
}

void UnplaceFiles(LibraryState &state, const Ledger &ledger,
                  const std::vector<Journal::Entry> &entries, bool afterCrash, Caption &caption,
                  Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  const auto providers = ledger.LastProviders();
  const std::unordered_set<std::string> kept = KeptOriginals(keeping);
  GamePlaces places(state.EAWDir);
  ProgressMeter meter(caption, static_cast<int>(entries.size()));
  for (const Journal::Entry &entry : entries) {
    const PlacedFile &file = entry.file;
    const std::string key = PlaceKey(file.place, file.name);
    const bool originalKept = kept.count(key) > 0;
    const auto provider = providers.find(key);
    meter.NextFile(provider != providers.end() || originalKept ? "Please wait- copying: :"
                                                               : "Deleting ",
                   file.name);
    if (IsSaveFile(file.name))
      continue;
    const fs::path &folder = places.Folder(file.place);
    if (afterCrash)
      RemovePartial(PartialPath(Child(folder, file.name)));
    if (entry.keepOriginal && !originalKept)
      continue;
    if (provider != providers.end()) {
      if (CopyReplacing(FindAnyCase(Child(state.LibDir, provider->second), file.name),
                        Child(folder, file.name), failures))
        ++state.tally.restored;
    } else if (originalKept) {
      if (MoveReplacing(OriginalPath(keeping, file), Child(folder, file.name), failures))
        ++state.tally.restored;
    } else {
      if (places.Remover(file.place).Remove(file.name, failures))
        ++state.tally.removed;
    }
  }
}
