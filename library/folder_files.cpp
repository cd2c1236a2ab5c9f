#include "library/folder_files.h"

#include "base/listing.h"
#include "library/game_places.h"
#include "library/keeping.h"

#include <unordered_map>
#include <unordered_set>

namespace fs = std::filesystem;

namespace {

std::string Quoted(const std::string &text) { return "\"" + text + "\""; }

// The kept originals by PlaceKey, each place listed once.
std::unordered_set<std::string> KeptOriginals(const fs::path &keeping) {
  std::unordered_set<std::string> kept;
  for (const Place place : {Place::Game, Place::Savedata, Place::Music})
    ForEachFile(OriginalsFolder(keeping, place),
                [&](std::string &&name) { kept.insert(PlaceKey(place, name)); });
  return kept;
}

// The state of a file of the loaded folder `folder`, given the folder whose copy the ledger
// says is in the game ("" for none).
FileState LoadedState(const FolderFile &file, const std::string &folder,
                      const std::string &provider, bool inLedger, bool originalKept) {
  if (!provider.empty() && provider != folder)
    return FileState::ReplacedBy;
  if (!file.gameHasOne)
    return FileState::Missing;
  // A file the ledger does not list for a folder it lists was not copied.
  if (provider.empty() && inLedger)
    return FileState::NotLoaded;
  return originalKept ? FileState::ReplacesOriginal : FileState::Loaded;
}

// Notes in `list` the other folders of the library that provide names of its files.
void FindConflicts(const LibraryState &state, FolderFileList &list,
                   const std::unordered_map<std::string, size_t> &byKey) {
  std::unordered_set<std::string> seen{list.folder};
  const FolderGrid &grid = state.Unigrid;
  for (int row = 0; row < grid.RowCount(); ++row) {
    const std::string &other = grid.Row(row).name;
    if (!seen.insert(other).second)
      continue;
    int shared = 0;
    ForEachFile(grid.PathOf(row), [&](std::string &&name) {
      if (StaysInLibrary(name))
        return;
      const auto found = byKey.find(PlaceKey(PlaceOf(name), name));
      if (found == byKey.end())
        return;
      list.files[found->second].alsoIn.push_back(other);
      ++shared;
    });
    if (shared > 0)
      list.conflicts.emplace_back(other, shared);
  }
}

} // namespace

FolderFileList ListFolderFiles(const LibraryState &state, int row, Failures &failures) {
  FolderFileList list;
  if (!state.Unigrid.IsFolderRow(row))
    return list;
  list.folder = state.Unigrid.Row(row).name;
  list.loaded = IsLoaded(state.Unigrid.Row(row));
  std::vector<std::string> names;
  for (std::string &name : ListFiles(state.Unigrid.PathOf(row)))
    if (!StaysInLibrary(name))
      names.push_back(std::move(name));
  const fs::path keeping = KeepingFolder(state.LibDir);
  const Ledger ledger = Ledger::Read(keeping, failures);
  const auto providers = ledger.LastProviders();
  const bool inLedger = ledger.Find(list.folder) != nullptr;
  const std::unordered_set<std::string> kept =
      list.loaded ? KeptOriginals(keeping) : std::unordered_set<std::string>{};
  GamePlaces places(state.EAWDir, names);
  std::unordered_map<std::string, size_t> byKey;
  for (const std::string &name : names) {
    FolderFile file;
    file.name = name;
    file.place = PlaceOf(name);
    const std::string key = PlaceKey(file.place, name);
    const auto found = providers.find(key);
    const std::string provider = found == providers.end() ? "" : found->second;
    file.gameHasOne = !places.Index(file.place).Matches(name).empty();
    if (list.loaded)
      file.state = LoadedState(file, list.folder, provider, inLedger, kept.count(key) > 0);
    if (file.state == FileState::ReplacedBy || !list.loaded)
      file.other = provider;
    byKey.emplace(key, list.files.size());
    list.files.push_back(std::move(file));
  }
  FindConflicts(state, list, byKey);
  return list;
}

std::string PlaceText(Place place) {
  switch (place) {
  case Place::Savedata:
    return "Savedata";
  case Place::Music:
    return "Music";
  case Place::Game:
    break;
  }
  return "game folder";
}

std::string FileStateText(const FolderFile &file) {
  switch (file.state) {
  case FileState::Loaded:
    return "loaded";
  case FileState::ReplacesOriginal:
    return "loaded, replaces the game's original (kept in the keeping folder)";
  case FileState::ReplacedBy:
    return "replaced by " + Quoted(file.other) + ", loaded later";
  case FileState::Missing:
    return "missing from the game";
  case FileState::NotLoaded:
    break;
  }
  if (!file.other.empty())
    return "not loaded; a load replaces " + Quoted(file.other) + "'s copy";
  if (file.gameHasOne)
    return "not loaded; a load replaces the game's file (and keeps it)";
  return "not loaded";
}

std::vector<std::string> ReplacedFileLines(const LibraryState &state, const std::string &folder,
                                           Failures &failures) {
  const Ledger ledger = Ledger::Read(KeepingFolder(state.LibDir), failures);
  std::unordered_map<std::string, std::string> before;
  for (const LoadedFolder &loaded : ledger.Folders())
    if (loaded.name != folder)
      for (const PlacedFile &file : loaded.files)
        before[PlaceKey(file.place, file.name)] = loaded.name;
  std::vector<std::string> lines;
  const LoadedFolder *loaded = ledger.Find(folder);
  if (loaded == nullptr)
    return lines;
  for (const PlacedFile &file : loaded->files) {
    const auto found = before.find(PlaceKey(file.place, file.name));
    if (found != before.end())
      lines.push_back(file.name +
                      (file.place == Place::Game ? "" : " in " + PlaceText(file.place)) + ", " +
                      Quoted(found->second) + "'s copy");
  }
  return lines;
}
