// crash_driver <game folder> <step> [name]: one step of the kill test in scripts/kill_test.sh.
//   start            start-up only: what a crash interrupted is finished or rolled back
//   click NAME       start-up, then a click on the folder row NAME (load or unload)
//   reset            start-up, then Reset All of every file it lists
//   music            start-up, then a switch to the first music set listed
//   ini              start-up, then eaw.ini saved from the editor with the same text each time
//   manifest FILE    notes the player's files (game folder and Savedata) and their checksums
//   check FILE       prints each damage found and exits 1 when there is any
#include "app/selector.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/text_file.h"
#include "library/file_rules.h"
#include "library/game_places.h"
#include "library/keeping.h"
#include "library/loaded_record.h"

#include <cstdint>
#include <fstream>
#include <iostream>
#include <map>
#include <set>

namespace fs = std::filesystem;

namespace {

// FNV-1a of the file's bytes; "missing" when it cannot be read.
std::string Checksum(const fs::path &file) {
  Failures ignored;
  const std::optional<std::string> bytes = ReadBytes(file, ignored);
  if (!bytes || !fs::is_regular_file(file))
    return "missing";
  std::uint64_t hash = 1469598103934665603ULL;
  for (char c : *bytes)
    hash = (hash ^ static_cast<unsigned char>(c)) * 1099511628211ULL;
  return std::to_string(hash);
}

// The player's files: relative path and checksum, of the game folder and "Savedata".
std::map<std::string, std::string> PlayerFiles(const fs::path &game) {
  std::map<std::string, std::string> files;
  for (const std::string &name : ListFiles(game))
    files[name] = Checksum(game / name);
  for (const std::string &name : ListFiles(game / "Savedata"))
    files["Savedata/" + name] = Checksum(game / "Savedata" / name);
  return files;
}

int WriteManifest(const fs::path &game, const fs::path &manifest) {
  std::ofstream out(manifest);
  for (const auto &[name, sum] : PlayerFiles(game))
    out << sum << ' ' << name << '\n';
  return 0;
}

// Where a player's file may rightly be: in its place, kept as an original, or, for a saved
// game, carried home into a campaign folder.
bool Found(const fs::path &game, const std::string &relative, const std::string &sum) {
  const bool saved = relative.starts_with("Savedata/");
  const std::string name = saved ? relative.substr(9) : relative;
  const fs::path keeping = KeepingFolder(game / "ZEP128");
  if (Checksum(game / relative) == sum ||
      Checksum(OriginalPath(keeping, {saved ? Place::Savedata : Place::Game, name})) == sum)
    return true;
  for (const fs::path &folder : ListFolders(game / "ZEP128"))
    if (IsSaveFile(name) && Checksum(folder / name) == sum)
      return true;
  return false;
}

// Notes each add-on file in the game that is neither the player's nor listed in the ledger: a
// copy left behind as if it were the game's own.
void LeftBehind(const fs::path &game, const Ledger &ledger, const std::set<std::string> &players,
                std::set<std::string> &damage) {
  std::set<std::string> listed;
  for (const LoadedFolder &folder : ledger.Folders())
    for (const PlacedFile &file : folder.files)
      listed.insert(PlaceKey(file.place, file.name));
  for (const FileStep &leftover : ledger.Leftovers())
    listed.insert(PlaceKey(leftover.file.place, leftover.file.name));
  GamePlaces places(game);
  for (const fs::path &folder : ListFolders(game / "ZEP128"))
    for (const std::string &name : ListFiles(folder)) {
      const Place place = PlaceOf(name);
      const std::string relative = (place == Place::Savedata ? "Savedata/" : "") + name;
      if (StaysInLibrary(name) || IsSaveFile(name) || place == Place::Music ||
          players.count(relative) || listed.count(PlaceKey(place, name)))
        continue;
      if (fs::exists(FindAnyCase(places.Folder(place), name)))
        damage.insert("add-on copy left behind: " + relative);
    }
}

int Check(const fs::path &game, const fs::path &manifest) {
  std::set<std::string> damage;
  for (const auto &entry : fs::recursive_directory_iterator(game))
    if (NameText(entry.path()).ends_with(".partial"))
      damage.insert("temporary file left: " + DisplayPath(entry.path()));
  std::ifstream in(manifest);
  std::set<std::string> players;
  for (std::string sum, name; in >> sum && std::getline(in >> std::ws, name);) {
    players.insert(name);
    if (!Found(game, name, sum))
      damage.insert("player's file lost or changed: " + name);
  }
  const LibraryState state = LibraryFor(game);
  Failures ignored;
  const fs::path keeping = KeepingFolder(state.LibDir);
  if (fs::exists(keeping / "journal.txt") || fs::exists(keeping / "music.txt"))
    damage.insert("a journal is still open");
  const Ledger ledger = Ledger::Read(keeping, ignored);
  std::set<std::string> recorded, ledgered;
  for (const std::string &name : ReadLoadedNames(state, ignored))
    recorded.insert(name);
  for (const LoadedFolder &folder : ledger.Folders())
    ledgered.insert(folder.name);
  if (recorded != ledgered)
    damage.insert("the record and the ledger disagree on what is loaded");
  GamePlaces places(game);
  for (const auto &[key, provider] : ledger.LastProviders()) {
    const LoadedFolder *folder = ledger.Find(provider);
    for (const PlacedFile &file : folder->files)
      if (PlaceKey(file.place, file.name) == key &&
          Checksum(Child(places.Folder(file.place), file.name)) !=
              Checksum(FindAnyCase(Child(state.LibDir, provider), file.name)))
        damage.insert("game file is not the loaded folder's copy: " + file.name);
  }
  LeftBehind(game, ledger, players, damage);
  if (!fs::is_directory(FindAnyCase(game, "Music")))
    damage.insert("the game has no Music folder");
  for (const std::string &line : damage)
    std::cout << line << '\n';
  return damage.empty() ? 0 : 1;
}

} // namespace

int main(int argc, char **argv) {
  if (argc < 3)
    return 2;
  const fs::path game = argv[1];
  const std::string step = argv[2];
  const std::string name = argc > 3 ? argv[3] : "";
  if (step == "manifest")
    return WriteManifest(game, name);
  if (step == "check")
    return Check(game, name);
  StoredCaption caption;
  NoProgramStarter starter;
  Selector selector(game, caption, starter);
  Failures failures = selector.StartUp().failures;
  if (step == "click") {
    const FolderGrid &grid = selector.State().Unigrid;
    for (int row = 0; row < grid.RowCount(); ++row)
      if (grid.Row(row).name == name) {
        failures.Append(selector.ClickRow(row).failures);
        break;
      }
  } else if (step == "reset") {
    failures.Append(selector.ResetAll(selector.ResetAllFiles(failures)).failures);
  } else if (step == "ini") {
    failures.Append(selector.SaveSettingsFile("[Main]\r\nWidth=800").failures);
  } else if (step == "music") {
    const MusicList music = selector.MusicSets(failures);
    if (music.current && !music.entries.empty())
      failures.Append(selector.SwitchMusic(*music.current, music.entries.front()).failures);
  }
  for (const std::string &line : failures.Lines())
    std::cerr << line << '\n';
  return 0;
}
