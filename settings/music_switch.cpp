#include "settings/music_switch.h"

#include "base/existence.h"
#include "base/names.h"
#include "settings/music_sets.h"

#include <system_error>

namespace fs = std::filesystem;

// Renames the folder `from` to `to`, refusing a target that exists in any letter case (a plain
// rename would silently replace an empty folder there).
static bool RenameFolder(const fs::path &from, const fs::path &to, Failures &failures) {
  FolderCheck(from);
  if (!FolderFound) {
    failures.Add(from, "cannot be renamed: there is no such folder");
    return false;
  }
  std::error_code error;
  if (fs::exists(FindAnyCase(to.parent_path(), NameText(to)), error)) {
    failures.Add(from, "cannot be renamed: " + DisplayPath(to) + " already exists");
    return false;
  }
  fs::rename(from, to, error);
  if (error) {
    failures.Add(from, "cannot be renamed to " + DisplayPath(to) + " (" + error.message() + ")");
    return false;
  }
  return true;
}

bool SwitchMusic(const fs::path &eawDir, const std::string &activeName,
                 const std::string &chosenName, Failures &failures) {
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
  if (!RenameFolder(music, active, failures))
    return false;
  if (RenameFolder(FindAnyCase(eawDir, chosenName), music, failures))
    return true;
  if (!RenameFolder(active, music, failures))
    failures.Add(active, "holds the game's music; rename it to \"Music\" by hand");
  return false;
}
