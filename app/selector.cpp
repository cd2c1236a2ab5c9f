#include "app/selector.h"

#include "app/category_file.h"
#include "app/startup.h"
#include "base/file_ops.h"
#include "library/category_view.h"
#include "library/grid_click.h"
#include "library/keeping.h"
#include "library/ledger_check.h"
#include "library/loaded_record.h"
#include "library/record_replay.h"
#include "library/recovery.h"
#include "library/reset_all.h"
#include "library/setup_switch.h"
#include "library/setups.h"
#include "settings/game_start.h"
#include "settings/ini_editor.h"
#include "settings/music_switch.h"

#include <set>

namespace fs = std::filesystem;

Selector::Selector(const fs::path &eawDir, Caption &caption, ProgramStarter &starter)
    : caption_(caption), starter_(starter) {
  static_cast<LibraryState &>(state_) = LibraryFor(eawDir);
}

Outcome Selector::StartUp() {
  Outcome outcome;
  Failures &failures = outcome.failures;
  FinishMusicSwitch(state_.EAWDir, MusicJournal(), failures);
  FinishInterrupted(state_, caption_, failures);
  RemovePartial(PartialPath(IniPath(state_.EAWDir)));
  RemovePartial(PartialPath(CategoryPath(state_.LibDir)));
  const std::vector<SkippedLine> skipped = PrepareLibrary(state_, failures);
  BuildGrid(state_, state_.Codes);
  EnsureRecord(state_, failures);
  ReplayRecord(state_, MendRecordFromLedger(state_, caption_, failures), failures);
  state_.BackPic = GamePicture(state_.EAWDir, "background");
  state_.NewPic = GamePicture(state_.EAWDir, "newpic");
  ShowCategory(0);
  if (!skipped.empty())
    for (const std::string &line : SkippedLinesMessage(skipped))
      failures.Add(line);
  return outcome;
}

std::string Selector::ShowCategory(int entry) {
  if (entry >= 0)
    state_.shownCategory = entry;
  return ::ShowCategory(state_.Unigrid, state_.Codes, entry);
}

// What the player should know about files a load replaced.
static std::string ReplacedNotice(const std::string &loaded,
                                  const std::vector<std::string> &folders) {
  if (folders.empty())
    return "";
  std::string names;
  for (const std::string &folder : folders)
    names += (names.empty() ? "\"" : ", \"") + folder + "\"";
  return "\"" + loaded + "\" replaced files of " + names + ", which stay loaded. Unloading \"" +
         loaded + "\" puts their files back.";
}

// The notice, then a line per replaced file.
static std::string WithLines(std::string notice, const std::vector<std::string> &lines) {
  for (const std::string &line : lines)
    notice += "\n" + line;
  return notice;
}

// "1 folder", "2 folders".
static std::string Count(size_t count, const std::string &what) {
  return std::to_string(count) + " " + what + (count == 1 ? "" : "s");
}

// "120 files copied, 2 deleted, 1 put back": what an operation did, for the player to see.
static std::string TallyText(const Tally &tally) {
  std::string text;
  const auto add = [&](int count, const char *what) {
    if (count == 0)
      return;
    text += (text.empty() ? "" : ", ") + std::to_string(count) +
            (text.empty() ? (count == 1 ? " file " : " files ") : " ") + what;
  };
  add(tally.copied, "copied");
  add(tally.removed, "deleted");
  add(tally.restored, "put back");
  return text.empty() ? "no file changed" : text;
}

Outcome Selector::ClickRow(int row) {
  Outcome outcome;
  state_.tally = {};
  outcome.summary = ""; // a click that changes nothing leaves no line of the action before
  const bool folderRow = state_.Unigrid.IsFolderRow(row);
  const bool wasLoaded = folderRow && IsLoaded(state_.Unigrid.Row(row));
  const std::vector<std::string> replaced =
      library::ClickRow(state_, row, caption_, outcome.failures);
  if (!folderRow || wasLoaded == IsLoaded(state_.Unigrid.Row(row)))
    return outcome;
  const std::string &name = state_.Unigrid.Row(row).name;
  outcome.done = true;
  outcome.summary =
      (wasLoaded ? "Unloaded \"" : "Loaded \"") + name + "\": " + TallyText(state_.tally) + ".";
  if (!replaced.empty())
    outcome.notice = WithLines(ReplacedNotice(name, replaced),
                               ReplacedFileLines(state_, name, outcome.failures));
  return outcome;
}

Outcome Selector::PressKey(int row, int key) {
  return key == kEnterKey ? ClickRow(row) : Outcome{};
}

// The names of the grid's folders, each once (a letter listed twice shows its folders twice).
static std::set<std::string> FolderNames(const FolderGrid &grid) {
  std::set<std::string> names;
  for (const GridRow &row : grid.rows)
    names.insert(row.name);
  return names;
}

// "Refresh: 212 folders, 3 new, 1 gone".
static std::string RefreshSummary(const std::set<std::string> &before,
                                  const std::set<std::string> &after) {
  const auto missingFrom = [](const std::set<std::string> &some, const std::set<std::string> &in) {
    size_t count = 0;
    for (const std::string &name : some)
      count += in.count(name) == 0 ? 1 : 0;
    return std::to_string(count);
  };
  return "Refresh: " + std::to_string(after.size()) +
         (after.size() == 1 ? " folder, " : " folders, ") + missingFrom(after, before) + " new, " +
         missingFrom(before, after) + " gone";
}

Outcome Selector::RefreshLibrary() {
  Outcome outcome;
  Failures &failures = outcome.failures;
  const std::set<std::string> before = FolderNames(state_.Unigrid);
  // Start-up writes both files when missing; a rebuild needs them just the same.
  EnsureCategoryFile(state_.LibDir, failures);
  BuildGrid(state_, LibraryCategories(state_.LibDir, failures).codes);
  EnsureRecord(state_, failures);
  ReplayRecord(state_, failures);
  // The rows under the pointer are other folders now, so the next move rebuilds the preview.
  state_.hoveredRow.reset();
  ShowCategory(state_.shownCategory);
  outcome.summary = RefreshSummary(before, FolderNames(state_.Unigrid));
  outcome.done = true;
  return outcome;
}

std::vector<std::string> Selector::ResetAllFiles(Failures &failures) const {
  return CleanUpNames(state_, failures);
}

int Selector::ResetAllLoadedFiles(Failures &failures) const {
  return LoadedFileCount(state_, failures);
}

Outcome Selector::ResetAll(const std::vector<std::string> &names) {
  // The way back: switching to this setup loads again what the reset unloads.
  Outcome outcome = SaveSetup(kBeforeResetAllSetup);
  if (!outcome.done) {
    outcome.failures.SetHeading(
        std::string("Nothing was reset: the loaded folders could not be saved "
                    "first as the setup \"") +
        kBeforeResetAllSetup + "\".");
    return outcome;
  }
  state_.tally = {};
  ::ResetAll(state_, names, caption_, outcome.failures);
  outcome.summary = "Reset All: " + TallyText(state_.tally) + ".";
  return outcome;
}

std::optional<FolderPreview> Selector::HoverRow(int row) {
  if (row == state_.hoveredRow)
    return std::nullopt;
  state_.hoveredRow = row;
  return PreviewOfRow(state_, row);
}

IniValues Selector::ReadSettings(Failures &failures) { return IniRead(state_.EAWDir, failures); }

Outcome Selector::SaveSettings(const IniTexts &texts) {
  Outcome outcome;
  const int saved = inisave(state_.EAWDir, texts, outcome.failures);
  outcome.done = saved >= 0;
  outcome.summary = saved < 0 ? ""
                              : std::to_string(saved) + (saved == 1 ? " setting" : " settings") +
                                    " saved to eaw.ini";
  return outcome;
}

std::string Selector::SettingsFileText(Failures &failures) {
  return IniDisplayText(state_.EAWDir, failures);
}

std::vector<std::string> Selector::ChangedSettings(const std::string &before,
                                                   const std::string &after) const {
  return ChangedKeys(before, after);
}

Outcome Selector::SaveSettingsFile(const std::string &text) {
  Outcome outcome;
  outcome.done = IniEditorSave(state_.EAWDir, text, outcome.failures);
  outcome.summary = outcome.done ? "eaw.ini saved" : "";
  return outcome;
}

MusicList Selector::MusicSets(Failures &failures) { return FillMusicList(state_.EAWDir, failures); }

Outcome Selector::SwitchMusic(const std::string &activeName, const std::string &chosenName) {
  Outcome outcome;
  outcome.done =
      ::SwitchMusic(state_.EAWDir, activeName, chosenName, MusicJournal(), outcome.failures);
  outcome.summary = outcome.done ? "Music set " + chosenName + " is playing" : "";
  return outcome;
}

Outcome Selector::StartGame() {
  Outcome outcome;
  outcome.done = ::StartGame(state_.EAWDir, starter_, outcome.failures);
  outcome.summary = outcome.done ? "Game started" : "";
  return outcome;
}

fs::path Selector::MusicJournal() const { return KeepingFolder(state_.LibDir) / "music.txt"; }

std::vector<std::string> Selector::LoadedFolderNames(Failures &failures) const {
  return LoadedInOrder(state_, failures);
}

std::vector<std::string> Selector::Setups() const { return SetupNames(state_.LibDir); }

bool Selector::HasSetup(const std::string &name) const { return SetupExists(state_.LibDir, name); }

Outcome Selector::SaveSetup(const std::string &name) {
  Outcome outcome;
  // A ledger that cannot be read leaves the grid's order, which is still worth keeping.
  const std::vector<std::string> loaded = LoadedInOrder(state_, outcome.failures);
  outcome.done = WriteSetup(state_.LibDir, name, loaded, outcome.failures);
  if (outcome.done)
    outcome.summary = "Saved " + Count(loaded.size(), "loaded folder") + " as \"" + name + "\".";
  return outcome;
}

Outcome Selector::SwitchToSetup(const std::string &name) {
  Outcome outcome;
  state_.tally = {};
  outcome.summary = "";
  const std::optional<std::vector<std::string>> folders =
      ReadSetup(state_.LibDir, name, outcome.failures);
  if (!folders)
    return outcome;
  const SwitchResult result = SwitchToFolders(state_, *folders, caption_, outcome.failures);
  outcome.done = true;
  outcome.summary = "Switched to \"" + name + "\": " + Count(result.unloaded, "folder") +
                    " unloaded, " + std::to_string(result.loaded) + " loaded; " +
                    TallyText(state_.tally) + ".";
  for (const std::string &line : result.notices)
    outcome.notice += (outcome.notice.empty() ? "" : "\n") + line;
  return outcome;
}

Outcome Selector::DeleteSetup(const std::string &name) {
  Outcome outcome;
  outcome.done = RemoveSetup(state_.LibDir, name, outcome.failures);
  return outcome;
}

FolderFileList Selector::FolderFiles(int row, Failures &failures) const {
  return ListFolderFiles(state_, row, failures);
}
