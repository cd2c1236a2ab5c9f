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
