#include "library/kept_links.h"

#include "base/links.h"
#include "library/game_places.h"
#include "library/keeping.h"

#include <vector>

namespace fs = std::filesystem;

bool RefusedForLink(const LibraryState &state, const fs::path &addon,
                    const std::string &consequence, Failures &failures) {
  const fs::path keeping = KeepingFolder(state.LibDir);
  std::vector<fs::path> folders = {keeping, keeping / "originals"};
  for (const Place place : {Place::Game, Place::Savedata, Place::Music})
    folders.push_back(OriginalsFolder(keeping, place));
  const PlaceFolders places = PlaceFoldersOf(state);
  folders.push_back(places[static_cast<size_t>(Place::Savedata)]);
  folders.push_back(places[static_cast<size_t>(Place::Music)]);
  if (!addon.empty())
    folders.push_back(addon);
  for (const fs::path &folder : folders) {
    if (IsLink(folder)) {
      RefuseLink(folder, consequence, failures);
      return true;
    }
  }
  return false;
}
