#include "library/unplace.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/names.h"
#include "library/game_places.h"

namespace fs = std::filesystem;

void UnplaceFiles(const LibraryState &state, const Ledger &ledger,
                  const std::vector<Journal::Entry> &entries, Caption &caption,
                  Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  const auto providers = ledger.LastProviders();
  GamePlaces places(state.EAWDir);
  for (const Journal::Entry &entry : entries) {
    const PlacedFile &file = entry.file;
    if (IsSaveFile(file.name))
      continue;
    const fs::path target = Child(places.Folder(file.place), file.name);
    RemovePartial(PartialPath(target));
    const fs::path original = OriginalPath(keeping, file);
    FileCheck(original);
    const bool originalKept = FileFound;
    if (entry.keepOriginal && !originalKept)
      continue;
    const auto provider = providers.find(PlaceKey(file.place, file.name));
    if (provider != providers.end()) {
      caption.Set("Please wait- copying: :" + file.name);
      CopyReplacing(FindAnyCase(Child(state.LibDir, provider->second), file.name), target,
                    failures);
    } else if (originalKept) {
      MoveReplacing(original, target, failures);
    } else {
      FileCheck(target);
      if (!FileFound)
        continue;
      caption.Set("Deleting " + file.name);
      RemoveFile(target, failures);
    }
  }
}
