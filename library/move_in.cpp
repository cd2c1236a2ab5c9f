#include "library/move_in.h"

#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "library/file_rules.h"
#include "library/game_places.h"

namespace fs = std::filesystem;

void MoveIn(const LibraryState &state, const fs::path &folder, Caption &caption,
            Failures &failures) {
  if (!state.Ready || folder == state.EAWDir)
    return;
  CaptionRestorer restorer(caption);
  GamePlaces places(state.EAWDir);
  for (const std::string &name : ListFiles(folder)) {
    if (StaysInLibrary(name))
      continue;
    const Place place = PlaceOf(name);
    const fs::path source = Child(folder, name);
    if (!places.Ensure(place, failures)) {
      failures.Add(source, "not copied, its game folder is missing");
      continue;
    }
    NameIndex &index = places.Index(place);
    const std::string target = index.TargetName(name);
    if (!CopyReplacing(source, Child(places.Folder(place), target), failures))
      continue;
    index.Add(target);
    caption.Set("Please wait- copying: :" + name);
  }
}
