#pragma once

#include "base/failures.h"
#include "base/file_remover.h"
#include "base/name_index.h"
#include "library/file_rules.h"
#include "library/library_state.h"

#include <array>
#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

// The folder of `place` in the game folder: the game folder itself, or its "Savedata" or
// "Music" subfolder found whatever its letter case (the usual spelling when there is none).
std::filesystem::path PlaceFolder(const std::filesystem::path &eawDir, Place place);
// The folders of the game's three places, by Place.
using PlaceFolders = std::array<std::filesystem::path, kPlaceCount>;
// Each place's folder as PlaceFolder finds it, with one listing of the game folder at most for
// "Savedata" and "Music" together (only when one is not there under its usual name).
PlaceFolders FindPlaceFolders(const std::filesystem::path &eawDir);
// The place folders of the operation under way, or found now when none is under way.
PlaceFolders PlaceFoldersOf(const LibraryState &state);
// Finds the place folders once for an operation (a click, Reset All, a recovery), for every step
// of it to use, and forgets them when it ends, so that the next one finds them anew.
class PlacesScope {
public:
  explicit PlacesScope(LibraryState &state);
  ~PlacesScope();
  PlacesScope(const PlacesScope &) = delete;
  PlacesScope &operator=(const PlacesScope &) = delete;

private:
  LibraryState &state_;
  bool outermost_;
};
// Creates the place folder `folder` when it is missing; false, with the reason in `failures`, when
// it neither exists nor can be created.
bool EnsurePlaceFolder(const std::filesystem::path &folder, Failures &failures);

// The game's three places during one load or unload: each found and listed at most once.
class GamePlaces {
public:
  // `names` are the file names the operation asks about (see Index).
  explicit GamePlaces(std::filesystem::path eawDir, std::vector<std::string> names = {})
      : eawDir_(std::move(eawDir)), names_(std::move(names)) {}
  // The same with the place folders found already for the operation.
  explicit GamePlaces(const PlaceFolders &folders, std::vector<std::string> names = {});
  // The place's folder, found on first use.
  const std::filesystem::path &Folder(Place place);
  // The place's files named in any case like one of the names given that go there (see PlaceOf),
  // listed on first use.
  NameIndex &Index(Place place);
  // Deletes files of the place's folder by name, which it opens on first use.
  FileRemover &Remover(Place place);
  // Creates the place's folder when missing; false, with the reason, when that fails.
  bool Ensure(Place place, Failures &failures);

private:
  struct Entry {
    std::optional<std::filesystem::path> folder;
    std::optional<NameIndex> index;
    std::optional<FileRemover> remover;
    std::optional<bool> usable;
  };
  Entry &At(Place place) { return entries_[static_cast<size_t>(place)]; }

  std::filesystem::path eawDir_;
  std::vector<std::string> names_;
  std::array<Entry, kPlaceCount> entries_;
};
