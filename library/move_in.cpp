#include "library/move_in.h"

#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/new_file.h"
#include "base/plain_name.h"
#include "base/progress_meter.h"
#include "library/file_rules.h"
#include "library/game_places.h"
#include "library/keeping.h"

#include <optional>
#include <set>
#include <system_error>
#include <unordered_set>

namespace fs = std::filesystem;

namespace {

// One file of the folder being loaded and where it goes.
struct Copy {
  std::string source; // its name in the folder
  Journal::Entry entry;
  std::uint64_t bytes; // its size, for the progress
};

// The paths of files in one folder, made by replacing the last part of one path: a new path for
// each would split every part of the folder's path again, which costs more than a copy.
class PathsIn {
public:
  explicit PathsIn(const fs::path &folder) : path_(Child(folder, "-")) {}
  const fs::path &Of(std::string_view name) {
    path_.replace_filename(Child({}, name));
    return path_;
  }

private:
  fs::path path_;
};

// Whether an original of that name is kept already at `path`; nothing when that cannot be told
// (a link or a folder in its place, an error), so that the game's file is left alone.
std::optional<bool> OriginalKept(const fs::path &path) {
  std::error_code error;
  const fs::file_status status = fs::symlink_status(path, error);
  if (status.type() == fs::file_type::not_found)
    return false;
  if (!error && fs::is_regular_file(status))
    return true;
  return std::nullopt;
}

// The PlaceKey of every entry of the originals folders, listed once, so that only a name found
// there is looked at alone.
std::unordered_set<std::string> KeptEntries(const OriginalsFolders &originals) {
  std::unordered_set<std::string> keys;
  for (const Place place : {Place::Game, Place::Savedata, Place::Music}) {
    std::error_code error;
    for (fs::directory_iterator it(originals[static_cast<size_t>(place)], error), end;
         !error && it != end; it.increment(error))
      keys.insert(PlaceKey(place, NameText(it->path())));
  }
  return keys;
}

// The copies a load makes, with the game's own files among their targets marked to be kept;
// notes in `overwritten` the loaded folders whose files it replaces.
std::vector<Copy> PlanCopies(const LibraryState &state, const fs::path &folder,
                             const std::vector<std::string> &files, const Ledger &ledger,
                             GamePlaces &places, std::set<std::string> &overwritten,
                             Failures &failures) {
  const OriginalsFolders originals = AllOriginalsFolders(KeepingFolder(state.LibDir));
  const std::unordered_set<std::string> keptEntries = KeptEntries(originals);
  const auto providers = ledger.LastProviders();
  std::vector<Copy> copies;
  PathsIn sources(folder);
  for (const std::string &name : files) {
    if (StaysInLibrary(name))
      continue;
    const Place place = PlaceOf(name);
    const fs::path &source = sources.Of(name);
    // The ledger takes plain names only, so that no copy is made that an unload cannot find.
    if (const std::string problem = PlainNameProblem(name); !problem.empty()) {
      failures.Add(source, "was not loaded: it is " + problem);
      continue;
    }
    if (!places.Ensure(place, failures)) {
      failures.Add(source, "not copied, its game folder is missing");
      continue;
    }
    const NameIndex &index = places.Index(place);
    const PlacedFile target{place, index.TargetName(name)};
    const std::string key = PlaceKey(place, target.name);
    const auto provider = providers.find(key);
    const fs::path &originalsFolder = originals[static_cast<size_t>(place)];
    bool keep = false;
    // A copy this folder made before (a ledger out of step with the record) is no original, and
    // neither is a copy an unload could not delete.
    if (provider != providers.end() && provider->second != NameText(folder)) {
      overwritten.insert(provider->second);
    } else if (provider == providers.end() && !index.Matches(name).empty() &&
               !ledger.IsLeftover(key)) {
      const std::optional<bool> keptAlready =
          keptEntries.count(key) > 0 ? OriginalKept(Child(originalsFolder, target.name)) : false;
      if (!keptAlready) {
        failures.Add(source, "not copied: the place for the game's own file in " +
                                 DisplayPath(originalsFolder) +
                                 " is taken by something that is no file");
        continue;
      }
      // Two files would claim to be the game's own (a saved game played on after an older one
      // was kept): neither may be lost.
      if (*keptAlready) {
        failures.Add(source, "not copied: the game's own file of that name is kept in " +
                                 DisplayPath(originalsFolder) +
                                 " already, and the game holds another one that would be lost");
        continue;
      }
      keep = true;
    }
    std::error_code error;
    const std::uintmax_t bytes = fs::file_size(source, error);
    copies.push_back({name, {target, keep}, error ? 0 : bytes});
  }
  return copies;
}

// After a failed copy, the game's own file goes back at once rather than at the next unload.
void PutOriginalBack(const fs::path &kept, const fs::path &destination, Failures &failures) {
  if (MoveReplacing(kept, destination, failures))
    failures.Add(destination, "is the game's own file again: it was put back because the copy "
                              "failed");
  else
    failures.Add(destination,
                 "is missing from the game: its original is kept in " + DisplayPath(kept));
}

} // namespace

std::optional<std::vector<std::string>> MoveIn(LibraryState &state, const fs::path &folder,
                                               Caption &caption, Failures &failures) {
  if (folder == state.EAWDir)
    return std::vector<std::string>{};
  CaptionRestorer restorer(caption);
  const fs::path keeping = KeepingFolder(state.LibDir);
  Ledger ledger = Ledger::Read(keeping, failures);
  const std::string name = NameText(folder);
  const FileListing listing = ListFilesOrReason(folder);
  if (listing.error) {
    failures.Add(folder,
                 "was not loaded: it cannot be listed (" + ReasonFor(folder, listing.error) + ")");
    return std::nullopt;
  }
  const std::vector<std::string> &files = listing.names;
  GamePlaces places(PlaceFoldersOf(state), files);
  std::set<std::string> overwritten;
  const std::vector<Copy> copies =
      PlanCopies(state, folder, files, ledger, places, overwritten, failures);
  ledger.Remove(name);
  Journal journal{Journal::Step::Load, name, {}};
  for (const Copy &copy : copies)
    journal.entries.push_back(copy.entry);
  if (!journal.Write(keeping, failures)) {
    failures.Add(folder, "was not loaded: the program cannot note what it is doing in " +
                             DisplayPath(keeping));
    return std::nullopt;
  }
  LoadedFolder loaded{name, {}};
  std::uint64_t bytes = 0;
  for (const Copy &copy : copies)
    bytes += copy.bytes;
  ProgressMeter meter(caption, static_cast<int>(copies.size()), bytes);
  const CopyProgress progress = [&meter](std::uint64_t copied) { meter.Copied(copied); };
  PathsIn sources(folder);
  std::vector<PathsIn> destinations, originals;
  for (const Place place : {Place::Game, Place::Savedata, Place::Music}) {
    destinations.emplace_back(places.Folder(place));
    originals.emplace_back(OriginalsFolder(keeping, place));
  }
  for (const Copy &copy : copies) {
    const PlacedFile &target = copy.entry.file;
    meter.NextFile("Please wait- copying: :", target.name, copy.bytes);
    const size_t at = static_cast<size_t>(target.place);
    const fs::path &destination = destinations[at].Of(target.name);
    const fs::path &kept = originals[at].Of(target.name);
    // The game's own file goes into safekeeping first; one that cannot is not overwritten.
    if (copy.entry.keepOriginal && !MoveReplacing(destination, kept, failures))
      continue;
    if (!CopyJournaled(sources.Of(copy.source), destination, failures, progress)) {
      if (copy.entry.keepOriginal)
        PutOriginalBack(kept, destination, failures);
      continue;
    }
    loaded.files.push_back(target);
    ++state.tally.copied;
  }
  ledger.Append(std::move(loaded));
  ledger.Write(keeping, failures);
  journal.step = Journal::Step::Loaded;
  journal.entries.clear();
  journal.Write(keeping, failures);
  return std::vector<std::string>(overwritten.begin(), overwritten.end());
}
