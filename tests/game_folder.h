#pragma once

#include "base/caption.h"
#include "base/failures.h"
#include "base/program_starter.h"
#include "library/folder_grid.h"
#include "tests/test_folder.h"

#include <filesystem>
#include <initializer_list>
#include <string>
#include <utility>
#include <vector>

// A temporary game folder with a library below it, built up by the tests.
class GameFolder : public TestFolder {
public:
  // Adds "Savedata" and "Music", as the game has them.
  const GameFolder &WithGameFolders() const;
  // Writes the category file.
  const GameFolder &WithCategories(const std::string &lines) const;
  // Writes the loaded-folders record.
  const GameFolder &WithRecord(const std::string &bytes) const;
  // Creates the add-on folder `name` with `files`, each holding its own name.
  std::filesystem::path Addon(const std::string &name,
                              std::initializer_list<const char *> files = {}) const;
  std::filesystem::path Library() const { return Path() / "ZEP128"; }
  std::string Record() const { return Read("ZEP128/FoldersLoaded.txt"); }
};

// A caption that keeps every text it was given, for checking progress lines.
class RecordingCaption : public Caption {
public:
  std::string Get() const override { return text; }
  void Set(const std::string &newText) override {
    text = newText;
    shown.push_back(newText);
  }
  void Progress(const ProgressFigures &figures) override {
    progress.emplace_back(figures.done, figures.total);
  }
  std::chrono::milliseconds ProgressInterval() const override { return {}; }
  // Whether `line` was shown, alone or followed by how far the operation was ("(2 of 5)").
  bool Showed(const std::string &line) const;
  std::string text = "Selector";
  std::vector<std::string> shown;
  std::vector<std::pair<int, int>> progress;
};

// A starter that only notes what it was asked to start.
class NotingStarter : public ProgramStarter {
public:
  bool StartDetached(const std::filesystem::path &program, bool windowsProgram) override {
    started.push_back(program);
    windows.push_back(windowsProgram);
    return true;
  }
  std::vector<std::filesystem::path> started;
  std::vector<bool> windows;
};

// Passes when `failures` holds exactly one line and it contains `part`.
::testing::AssertionResult OneFailure(const Failures &failures, const std::string &part);

// The names of the grid's folder rows, in row order; with `marks`, a loaded row's name is
// followed by " [S]".
std::vector<std::string> RowNames(const FolderGrid &grid, bool marks = false);
// The first row named `name`, or -1.
int RowOf(const FolderGrid &grid, const std::string &name);
