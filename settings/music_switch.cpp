#include "settings/music_switch.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/links.h"
#include "base/names.h"
#include "base/new_file.h"
#include "base/plain_name.h"
#include "base/text_file.h"
#include "settings/music_sets.h"

#include <optional>
#include <system_error>

namespace fs = std::filesystem;

// Why `from` cannot become `to`, or nothing: it must be a folder, and no entry but `from` and
// `leaving` (renamed away first) may have the name `to` in any letter case: a plain rename would
// replace an empty folder there, and the game could not tell two such folders apart.
static std::optional<std::string> RenameRefusal(const fs::path &from, const fs::path &to,
                                                const fs::path &leaving = {}) {
  if (!FolderCheck(from))
    return DisplayPath(from) + " is no folder";
  if (IsLink(from))
    return DisplayPath(from) + " " + kLinkReason;
  for (const fs::path &entry : EntriesAnyCase(to.parent_path(), NameText(to)))
    if (entry != from && entry != leaving)
      return DisplayPath(entry) + " is in the way";
  return std::nullopt;
}

static bool Rename(const fs::path &from, const fs::path &to, Failures &failures) {
  std::error_code error;
  fs::rename(from, to, error);
  if (error)
    failures.Add(from,
                 "cannot be renamed to " + DisplayPath(to) + " (" + ReasonFor(from, error) + ")");
  return !error;
}

bool SwitchMusic(const fs::path &eawDir, const std::string &activeName,
                 const std::string &chosenName, const fs::path &journal, Failures &failures) {
  if (IsReservedFolderName(chosenName) || IsReservedFolderName(activeName)) {
    failures.Add("The music was not switched: \"" +
                 (IsReservedFolderName(chosenName) ? chosenName : activeName) +
                 "\" is a folder the game or this program needs, not a music set.");
    return false;
  }
  if (!IsMusicSetName(activeName)) {
    failures.Add("The music was not switched: no current music set is known (every set listed "
                 "in Music.ini has a folder of its own).");
    return false;
  }
  if (!IsMusicSetName(chosenName)) {
    failures.Add("The music was not switched: \"" + chosenName + "\" is not a folder name.");
    return false;
  }
  const fs::path music = FindAnyCase(eawDir, "Music");
  const fs::path active = Child(eawDir, activeName);
  const fs::path chosen = FindAnyCase(eawDir, chosenName);
  // Every refusal is decided before the first rename, so that a refused switch changes nothing.
  std::optional<std::string> refusal;
  if (IsLink(journal.parent_path()))
    refusal = DisplayPath(journal.parent_path()) + " " + kLinkReason;
  if (!refusal)
    refusal = RenameRefusal(music, active);
  if (!refusal)
    refusal = RenameRefusal(chosen, Child(eawDir, "Music"), music);
  if (refusal) {
    failures.Add("The music was not switched: " + *refusal + ".");
    return false;
  }
  std::error_code error;
  fs::create_directories(journal.parent_path(), error);
  if (!WriteAtomically(journal, JoinCrLf({NameText(music), activeName, NameText(chosen)}),
                       failures))
    return false;
  bool switched = false;
  if (Rename(music, active, failures)) {
    switched = Rename(chosen, music, failures);
    if (!switched && !Rename(active, music, failures))
      failures.Add(active, "holds the game's music; rename it to \"Music\" by hand");
  }
  fs::remove(journal, error);
  return switched;
}

// Whether the journal's three lines name the music folder, the set put away and the chosen set;
// each line that does not is named in `failures`.
static bool NamesTheSwitch(const std::vector<std::string> &lines, const fs::path &journal,
                           Failures &failures) {
  bool named = true;
  for (size_t at = 0; at < 3; ++at) {
    const std::string &name = lines[at];
    std::string problem = MusicSetProblem(name);
    if (problem.empty() && at == 0 && FoldName(StoredName(name)) != FoldName("Music"))
      problem = "not the game's music folder";
    else if (problem.empty() && at > 0 && IsReservedFolderName(name))
      problem = "a folder the game or this program needs";
    if (!problem.empty())
      RefuseLine(journal, at + 1, name, problem, failures);
    named = named && problem.empty();
  }
  return named;
}

void FinishMusicSwitch(const fs::path &eawDir, const fs::path &journal, Failures &failures) {
  std::error_code error;
  if (IsLink(journal.parent_path())) {
    if (fs::exists(fs::symlink_status(journal, error)))
      RefuseLink(journal.parent_path(), "the music switch cut short was not finished", failures);
    return;
  }
  const auto lines = ReadLinesIfExists(journal, failures);
  fs::remove(PartialPath(journal), error);
  if (!lines)
    return;
  if (lines->size() == 3 && NamesTheSwitch(*lines, journal, failures)) {
    const fs::path music = Child(eawDir, (*lines)[0]);
    if (!FolderCheck(FindAnyCase(eawDir, "Music"))) {
      const fs::path from =
          Child(eawDir, FolderCheck(Child(eawDir, (*lines)[2])) ? (*lines)[2] : (*lines)[1]);
      if (IsLink(from))
        RefuseLink(from, "the music switch cut short was not finished", failures);
      else
        Rename(from, music, failures);
    }
  }
  fs::remove(journal, error);
}
