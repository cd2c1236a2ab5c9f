#pragma once

#include "app/outcome.h"
#include "app/selector_state.h"
#include "base/caption.h"
#include "base/failures.h"
#include "base/program_starter.h"
#include "library/folder_files.h"
#include "library/preview.h"
#include "settings/eaw_ini.h"
#include "settings/music_sets.h"

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

// The key code of Enter, which acts on a grid row as a click.
inline constexpr int kEnterKey = 13;

// What the program can do, for one game folder: the window calls these verbs and draws State().
// Every verb finishes what it can; a verb that changes something returns its Outcome (summary
// line, notice, failures), one that only asks records what it could not read in `failures`.
class Selector {
public:
  // `caption` shows the progress of long file work; `starter` starts the game.
  Selector(const std::filesystem::path &eawDir, Caption &caption, ProgramStarter &starter);

  const SelectorState &State() const { return state_; }

  // Finishes or rolls back what a crash interrupted, creates the library's files when missing,
  // reads the categories, builds the grid, mends the record where the ledger says otherwise,
  // marks the recorded folders loaded without touching a file, finds the pictures and shows
  // every folder. The outcome holds only what could not be done.
  Outcome StartUp();
  // Shows category list entry `entry`; returns the text of the code-letter label.
  std::string ShowCategory(int entry);
  // Loads or unloads the folder of grid row `row` (a click on it); the summary says which and
  // what changed, and is cleared when nothing did. The notice names the loaded folders whose
  // files a load replaced, on its first line, then one line per replaced file.
  Outcome ClickRow(int row);
  // A key pressed on grid row `row`: Enter acts as a click; other keys change nothing.
  Outcome PressKey(int row, int key);
  // The next shown row from `from` on whose name starts with the typed `prefix`; -1 for none.
  int FindRow(int from, const std::string &prefix) const {
    return state_.Unigrid.FindShownRow(from, prefix);
  }
  // Rebuilds the grid from the library on disk, keeping the loaded marks and the category shown;
  // the summary counts the folders, the new and the gone ones.
  Outcome RefreshLibrary();
  // The game-folder files that Reset All would delete besides the loaded folders' copies, for the
  // player to agree to.
  std::vector<std::string> ResetAllFiles(Failures &failures) const;
  // How many files of loaded folders Reset All would take out.
  int ResetAllLoadedFiles(Failures &failures) const;
  // Unloads every loaded folder, deletes the add-on files `names` from the game folder, puts the
  // kept originals back and empties the record. Saves the loaded folders as a setup first;
  // when that fails nothing is reset and the summary stays.
  Outcome ResetAll(const std::vector<std::string> &names);
  // The preview of grid row `row` (-1 for the grid's header) when the pointer has entered it;
  // nothing when it was already over that row.
  std::optional<FolderPreview> HoverRow(int row);
  // The pointer left the grid and the preview was cleared: the next row entered shows again.
  void LeaveGrid() { state_.hoveredRow.reset(); }
  // The six settings of eaw.ini as the boxes show them.
  IniValues ReadSettings(Failures &failures);
  // Writes the six box texts into eaw.ini; done, and the summary says how many were saved,
  // unless the file could not be written (the summary is then cleared).
  Outcome SaveSettings(const IniTexts &texts);
  // The whole of eaw.ini for the editor.
  std::string SettingsFileText(Failures &failures);
  // The settings keys whose lines differ between two texts of eaw.ini.
  std::vector<std::string> ChangedSettings(const std::string &before,
                                           const std::string &after) const;
  // Saves the editor's text as eaw.ini; done when it was written, and then said in the summary
  // (cleared otherwise).
  Outcome SaveSettingsFile(const std::string &text);
  // The music sets of Music.ini.
  MusicList MusicSets(Failures &failures);
  // Makes `chosenName` the game's music in place of `activeName`; done when switched, and then
  // said in the summary.
  Outcome SwitchMusic(const std::string &activeName, const std::string &chosenName);
  // Starts the game; done, and said in the summary, when it was started.
  Outcome StartGame();

  // The loaded folders in the order they were loaded.
  std::vector<std::string> LoadedFolderNames(Failures &failures) const;
  // The names of the saved setups, in name order.
  std::vector<std::string> Setups() const;
  // Whether a setup of that name exists (in any letter case).
  bool HasSetup(const std::string &name) const;
  // Saves the loaded folders, in load order, as setup `name`, replacing one of that name. Not
  // done, with the reason and the summary left as it was, when the name is unusable or the file
  // cannot be written.
  Outcome SaveSetup(const std::string &name);
  // Unloads the loaded folders setup `name` does not hold and loads those it holds, in its order,
  // as clicks would. The notice names folders the category rules left out; a setup file that is
  // not a plain list of folder names is refused whole, with the summary cleared.
  Outcome SwitchToSetup(const std::string &name);
  // Deletes setup `name`; not done, with the reason, when it cannot. The summary stays.
  Outcome DeleteSetup(const std::string &name);
  // The files of the folder of grid row `row`, where each goes and its state now, and the other
  // folders that provide the same names.
  FolderFileList FolderFiles(int row, Failures &failures) const;

private:
  std::filesystem::path MusicJournal() const;

  SelectorState state_;
  Caption &caption_;
  ProgramStarter &starter_;
};
