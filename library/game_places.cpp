#include "library/game_places.h"

#include "base/names.h"

#include <system_error>

namespace fs = std::filesystem;

fs::path PlaceFolder(const fs::path &eawDir, Place place) {
  switch (place) {
  case Place::Savedata:
    return FindAnyCase(eawDir, "Savedata");
  case Place::Music:
    return FindAnyCase(eawDir, "Music");
  case Place::Game:
    break;
  }
  return eawDir;
}

PlaceFolders FindPlaceFolders(const fs::path &eawDir) {
  PlaceFolders folders;
  folders[static_cast<size_t>(Place::Game)] = eawDir;
  std::vector<std::pair<Place, std::string>> missing;
  for (const auto &[place, name] :
       {std::pair{Place::Savedata, "Savedata"}, {Place::Music, "Music"}}) {
    fs::path &folder = folders[static_cast<size_t>(place)];
    folder = Child(eawDir, name);
    std::error_code error;
    if (!fs::exists(folder, error))
      missing.emplace_back(place, FoldName(name));
  }
  if (missing.empty())
    return folders;
  std::error_code error;
  for (fs::directory_iterator it(eawDir, error), end; !error && it != end && !missing.empty();
       it.increment(error)) {
    const std::string folded = FoldName(NameText(it->path()));
    // The first entry found of each name, as FindAnyCase takes it.
    for (auto wanted = missing.begin(); wanted != missing.end();)
      if (folded == wanted->second) {
        folders[static_cast<size_t>(wanted->first)] = it->path();
        wanted = missing.erase(wanted);
      } else {
        ++wanted;
      }
  }
  return folders;
}

PlaceFolders PlaceFoldersOf(const LibraryState &state) {
  return state.places ? *state.places : FindPlaceFolders(state.EAWDir);
}

PlacesScope::PlacesScope(LibraryState &state) : state_(state), outermost_(!state.places) {
  if (outermost_)
    state_.places = FindPlaceFolders(state_.EAWDir);
}

PlacesScope::~PlacesScope() {
  if (outermost_)
    state_.places.reset();
}

bool EnsurePlaceFolder(const fs::path &folder, Failures &failures) {
  std::error_code error;
  if (fs::is_directory(folder, error))
    return true;
  fs::create_directory(folder, error);
  std::error_code kindError;
  if (!error && fs::is_directory(folder, kindError))
    return true;
  failures.Add(folder, "cannot be created (" +
                           (error ? error.message() : std::string("a file is in the way")) + ")");
  return false;
}

GamePlaces::GamePlaces(const PlaceFolders &folders, std::vector<std::string> names)
    : eawDir_(folders[static_cast<size_t>(Place::Game)]), names_(std::move(names)) {
  for (const Place place : {Place::Game, Place::Savedata, Place::Music})
    At(place).folder = folders[static_cast<size_t>(place)];
}

const fs::path &GamePlaces::Folder(Place place) {
  Entry &entry = At(place);
  if (!entry.folder)
    entry.folder = PlaceFolder(eawDir_, place);
  return *entry.folder;
}

NameIndex &GamePlaces::Index(Place place) {
  Entry &entry = At(place);
  if (!entry.index) {
    std::vector<std::string> wanted;
    for (const std::string &name : names_)
      if (PlaceOf(name) == place)
        wanted.push_back(name);
    entry.index.emplace(Folder(place), wanted);
  }
  return *entry.index;
}

FileRemover &GamePlaces::Remover(Place place) {
  Entry &entry = At(place);
  if (!entry.remover)
    entry.remover.emplace(Folder(place));
  return *entry.remover;
}

bool GamePlaces::Ensure(Place place, Failures &failures) {
  Entry &entry = At(place);
  if (!entry.usable)
    entry.usable = EnsurePlaceFolder(Folder(place), failures);
  return *entry.usable;
}
