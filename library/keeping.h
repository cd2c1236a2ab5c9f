#pragma once

#include "base/failures.h"
#include "library/file_rules.h"

#include <array>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

// The program's own folder in the library: the game's originals that loads replaced, the list of
// what each loaded folder put into the game, and the journal of an operation under way. No
// category letter is "#", and the grid skips it by name as well.
inline constexpr char kKeepingFolder[] = "#Selector";

// A file that a load put into the game: where, and the name it has there.
struct PlacedFile {
  Place place = Place::Game;
  std::string name;
};

// What one loaded folder put into the game.
struct LoadedFolder {
  std::string name;
  std::vector<PlacedFile> files;
};

// One file an operation takes out of the game or puts in.
struct FileStep {
  PlacedFile file;
  // The game's own file of this name is involved: a load moves it into the keeping folder
  // first, an unload puts it back. Either way, to undo or finish the step, whatever is kept
  // goes back, and while nothing is kept the game's file is that original and stays.
  bool keepOriginal = false;
};

// The place and the folded name that identify one file of the game whatever its letter case.
std::string PlaceKey(Place place, std::string_view name);

// The loaded folders in the order they were loaded, kept in "loaded.txt" of the keeping folder.
class Ledger {
public:
  // Reads the ledger of the keeping folder `keeping`; a missing one lists no folder. A temporary
  // file left by an interrupted write of it is removed.
  static Ledger Read(const std::filesystem::path &keeping, Failures &failures);
  // Replaces the ledger file atomically; false, with the reason, when it cannot be written.
  bool Write(const std::filesystem::path &keeping, Failures &failures) const;

  const LoadedFolder *Find(std::string_view name) const;
  // Copies an unload could not delete (a file the game held open): still to be taken out at the
  // next unload, Reset All or start, and never taken for an original.
  const std::vector<FileStep> &Leftovers() const { return leftovers_; }
  void SetLeftovers(std::vector<FileStep> files) { leftovers_ = std::move(files); }
  void AddLeftovers(const std::vector<FileStep> &files);
  // Whether the file `key` (see PlaceKey) is a leftover copy.
  bool IsLeftover(const std::string &key) const;
  void Remove(std::string_view name);
  void Append(LoadedFolder folder) { folders_.push_back(std::move(folder)); }
  const std::vector<LoadedFolder> &Folders() const { return folders_; }
  // For each PlaceKey, the name of the folder loaded last that put such a file into the game.
  std::unordered_map<std::string, std::string> LastProviders() const;

private:
  std::vector<LoadedFolder> folders_;
  std::vector<FileStep> leftovers_;
};

// What an interrupted operation was doing, written before it touches a file.
struct Journal {
  enum class Step { Load, Loaded, Unload, Reset, Restore };
  using Entry = FileStep;
  Step step = Step::Load;
  std::string folder;
  std::vector<Entry> entries;

  // The journal of the keeping folder, or nothing when no operation was interrupted; a temporary
  // file left by an interrupted write of it is removed.
  static std::optional<Journal> Read(const std::filesystem::path &keeping, Failures &failures);
  bool Write(const std::filesystem::path &keeping, Failures &failures) const;
  // Closes the journal once everything the operation wrote is on the disk.
  static void Remove(const std::filesystem::path &keeping);
  // Whether the keeping folder holds a journal, that is, an operation was interrupted.
  static bool Pending(const std::filesystem::path &keeping);
};

// The keeping folder of the library `libDir`.
std::filesystem::path KeepingFolder(const std::filesystem::path &libDir);
// The folder in which the originals of `place` are kept.
std::filesystem::path OriginalsFolder(const std::filesystem::path &keeping, Place place);
// The originals folder of each place, for an operation that names many files: a path costs
// more to build than a rename.
using OriginalsFolders = std::array<std::filesystem::path, kPlaceCount>;
OriginalsFolders AllOriginalsFolders(const std::filesystem::path &keeping);
// Where the original of `file` is kept.
std::filesystem::path OriginalPath(const std::filesystem::path &keeping, const PlacedFile &file);
// Moves `from` to `to`, replacing `to`: a rename, or a copy and a delete across disks. False, with
// the reason, when `from` is still where it was.
bool MoveReplacing(const std::filesystem::path &from, const std::filesystem::path &to,
                   Failures &failures);
