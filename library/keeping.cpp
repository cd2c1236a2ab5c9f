#include "library/keeping.h"

#include "base/file_ops.h"
#include "base/names.h"
#include "base/plain_name.h"
#include "base/step_seam.h"
#include "base/text_file.h"

#include <algorithm>
#include <system_error>

namespace fs = std::filesystem;

namespace {

constexpr char kLedgerFile[] = "loaded.txt";
// The ledger and the journal list every file of the loaded folders: allow for a great many.
constexpr std::uintmax_t kMaxKeepingBytes = std::uintmax_t{256} << 20;
constexpr char kJournalFile[] = "journal.txt";
constexpr std::string_view kPlaceLetters = "GSM";
constexpr std::string_view kSteps[] = {"load", "loaded", "unload", "reset", "restore"};

char PlaceLetter(Place place) { return kPlaceLetters[static_cast<size_t>(place)]; }

std::optional<Place> PlaceFromLetter(char letter) {
  const size_t at = kPlaceLetters.find(letter);
  if (at == std::string_view::npos)
    return std::nullopt;
  return static_cast<Place>(at);
}

// A name that a line can hold: one without line ends or a leading tab.
bool Storable(std::string_view name) {
  return !name.empty() && name.front() != '\t' &&
         std::none_of(name.begin(), name.end(), [](char c) { return c == '\r' || c == '\n'; });
}

// Appends a file line to `text`: a tab, the place letter, the keep mark, the name and the line
// end; a name that no line can hold is left out.
void AppendFileLine(std::string &text, const PlacedFile &file, char mark) {
  if (!Storable(file.name))
    return;
  text += '\t';
  text += PlaceLetter(file.place);
  text += mark;
  text += file.name;
  text += "\r\n";
}

// A file line of the ledger or the journal, and its mark.
struct FileLineParts {
  PlacedFile file;
  char mark = ' ';
};

// The one place where file lines are read: a line that is no file line gives nothing.
std::optional<FileLineParts> ParseFileLine(const std::string &line) {
  if (line.size() < 4 || line[0] != '\t')
    return std::nullopt;
  const std::optional<Place> place = PlaceFromLetter(line[1]);
  if (!place)
    return std::nullopt;
  return FileLineParts{{*place, line.substr(3)}, line[2]};
}

// The marks of a leftover copy in the ledger: one to delete, one whose original comes back.
constexpr char kLeftoverMark = '!';
constexpr char kLeftoverOverOriginalMark = '^';

} // namespace

std::string PlaceKey(Place place, std::string_view name) {
  return PlaceLetter(place) + FoldName(name);
}

fs::path KeepingFolder(const fs::path &libDir) { return libDir / kKeepingFolder; }

fs::path OriginalsFolder(const fs::path &keeping, Place place) {
  return keeping / "originals" / std::string(1, PlaceLetter(place));
}

OriginalsFolders AllOriginalsFolders(const fs::path &keeping) {
  OriginalsFolders folders;
  for (const Place place : {Place::Game, Place::Savedata, Place::Music})
    folders[static_cast<size_t>(place)] = OriginalsFolder(keeping, place);
  return folders;
}

fs::path OriginalPath(const fs::path &keeping, const PlacedFile &file) {
  return Child(OriginalsFolder(keeping, file.place), file.name);
}

Ledger Ledger::Read(const fs::path &keeping, Failures &failures) {
  Ledger ledger;
  const fs::path path = keeping / kLedgerFile;
  RemovePartial(PartialPath(path));
  const auto lines = ReadLinesIfExists(path, failures, Encoding::Bytes, kMaxKeepingBytes);
  if (!lines)
    return ledger;
  // The lines of a refused folder belong to no folder.
  bool inFolder = false;
  for (size_t at = 0; at < lines->size(); ++at) {
    const std::string &line = (*lines)[at];
    if (const std::optional<FileLineParts> parts = ParseFileLine(line)) {
      if (!AcceptPlainName(parts->file.name, path, at + 1, failures))
        continue;
      if (parts->mark == kLeftoverMark || parts->mark == kLeftoverOverOriginalMark)
        ledger.leftovers_.push_back({parts->file, parts->mark == kLeftoverOverOriginalMark});
      else if (inFolder)
        ledger.folders_.back().files.push_back(parts->file);
    } else if (Storable(line)) {
      inFolder = AcceptPlainName(line, path, at + 1, failures);
      if (inFolder)
        ledger.folders_.push_back({line, {}});
    }
  }
  return ledger;
}

bool Ledger::Write(const fs::path &keeping, Failures &failures) const {
  std::string text;
  // Before the first folder line, so that they belong to no folder.
  for (const FileStep &leftover : leftovers_)
    AppendFileLine(text, leftover.file,
                   leftover.keepOriginal ? kLeftoverOverOriginalMark : kLeftoverMark);
  for (const LoadedFolder &folder : folders_) {
    if (!Storable(folder.name))
      continue;
    text += folder.name + "\r\n";
    for (const PlacedFile &file : folder.files)
      AppendFileLine(text, file, ' ');
  }
  std::error_code error;
  fs::create_directories(keeping, error);
  return WriteAtomically(keeping / kLedgerFile, text, failures);
}

const LoadedFolder *Ledger::Find(std::string_view name) const {
  for (const LoadedFolder &folder : folders_)
    if (folder.name == name)
      return &folder;
  return nullptr;
}

void Ledger::Remove(std::string_view name) {
  folders_.erase(std::remove_if(folders_.begin(), folders_.end(),
                                [&](const LoadedFolder &folder) { return folder.name == name; }),
                 folders_.end());
}

void Ledger::AddLeftovers(const std::vector<FileStep> &files) {
  for (const FileStep &leftover : files)
    if (!IsLeftover(PlaceKey(leftover.file.place, leftover.file.name)))
      leftovers_.push_back(leftover);
}

bool Ledger::IsLeftover(const std::string &key) const {
  return std::any_of(leftovers_.begin(), leftovers_.end(), [&](const FileStep &leftover) {
    return PlaceKey(leftover.file.place, leftover.file.name) == key;
  });
}

std::unordered_map<std::string, std::string> Ledger::LastProviders() const {
  std::unordered_map<std::string, std::string> providers;
  for (const LoadedFolder &folder : folders_)
    for (const PlacedFile &file : folder.files)
      providers[PlaceKey(file.place, file.name)] = folder.name;
  return providers;
}

std::optional<Journal> Journal::Read(const fs::path &keeping, Failures &failures) {
  RemovePartial(PartialPath(keeping / kJournalFile));
  const auto lines =
      ReadLinesIfExists(keeping / kJournalFile, failures, Encoding::Bytes, kMaxKeepingBytes);
  if (!lines || lines->size() < 2)
    return std::nullopt;
  Journal journal;
  const auto step = std::find(std::begin(kSteps), std::end(kSteps), (*lines)[0]);
  if (step == std::end(kSteps))
    return std::nullopt;
  journal.step = static_cast<Step>(step - std::begin(kSteps));
  const fs::path path = keeping / kJournalFile;
  // Reset All names no folder; a refused one leaves the journal's files to be dealt with alone.
  if (!(*lines)[1].empty() && AcceptPlainName((*lines)[1], path, 2, failures))
    journal.folder = (*lines)[1];
  for (size_t i = 2; i < lines->size(); ++i)
    if (const std::optional<FileLineParts> parts = ParseFileLine((*lines)[i]))
      if (AcceptPlainName(parts->file.name, path, i + 1, failures))
        journal.entries.push_back({parts->file, parts->mark == '+'});
  return journal;
}

bool Journal::Write(const fs::path &keeping, Failures &failures) const {
  std::string text = std::string(kSteps[static_cast<size_t>(step)]) + "\r\n" + folder + "\r\n";
  for (const Entry &entry : entries)
    AppendFileLine(text, entry.file, entry.keepOriginal ? '+' : '-');
  std::error_code error;
  fs::create_directories(keeping, error);
  return WriteAtomically(keeping / kJournalFile, text, failures);
}

bool Journal::Pending(const fs::path &keeping) {
  std::error_code error;
  return fs::exists(fs::symlink_status(keeping / kJournalFile, error));
}

void Journal::Remove(const fs::path &keeping) {
  // The journal goes only once what it covers is on the disk, so that a power cut cannot leave
  // half-written copies with no journal to clear them away.
  FlushFileSystem(keeping);
  std::error_code error;
  fs::remove(keeping / kJournalFile, error);
  FlushFolder(keeping);
}

bool MoveReplacing(const fs::path &from, const fs::path &to, Failures &failures) {
  std::error_code error;
  // Mostly the folder is there and nothing is in the way: one rename, and checks only when not.
  fs::rename(from, to, error);
  if (error) {
    fs::create_directories(to.parent_path(), error);
    if (fs::exists(to, error))
      MakeWritable(to, failures);
    fs::rename(from, to, error);
  }
  if (!error) {
    StepDone();
    return true;
  }
  // Another disk: a complete copy first, so that the file is never in neither place.
  return CopyReplacing(from, to, failures) && RemoveFile(from, failures);
}
