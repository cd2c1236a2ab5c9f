#include "base/names.h"
#include "base/step_seam.h"
#include "library/keeping.h"
#include "library/loaded_record.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <functional>
#include <map>
#include <memory>
#include <set>

namespace {

using Files = std::map<std::string, std::string>; // game path -> bytes

// What each add-on folder puts where, and the game's own files before any load.
const std::map<std::string, Files> kFolders = {
    {"N-A", {{"sky.spt", "A sky"}, {"bases.dat", "A bases"}, {"Savedata/a.msn", "A mission"}}},
    {"N-B", {{"sky.spt", "B sky"}, {"bases.dat", "B bases"}}},
    {"S-X", {{"game.cfg", "X cfg"}, {"x.dat", "X x"}}},
    {"S-Y", {{"game.cfg", "Y cfg"}, {"y.dat", "Y y"}}}};
const Files kOwn = {
    {"bases.dat", "own bases"}, {"game.cfg", "own cfg"}, {"Savedata/a.msn", "player's mission"}};

// One operation: the folders loaded before it, and the folder it clicks (none: Reset All).
struct Operation {
  const char *name;
  std::vector<std::string> before;
  const char *click;
};

struct Kill {};

class CrashSteps : public ::testing::TestWithParam<Operation> {
protected:
  void SetUp() override {
#ifndef _WIN32
    // Hundreds of operations, each flushed to the disk: on a memory file system where there is
    // one, so that the flushes cost nothing.
    oldTemporary = std::getenv("TMPDIR") ? std::getenv("TMPDIR") : "";
    if (fs::is_directory("/dev/shm"))
      ::setenv("TMPDIR", "/dev/shm", 1);
#endif
    // Stops what runs at its chosen committed step by throwing, as a kill there would.
    SetStepHook([this] {
      if (--stepsLeft == 0)
        throw Kill{};
    });
  }
  void TearDown() override {
    SetStepHook({});
#ifndef _WIN32
    oldTemporary.empty() ? ::unsetenv("TMPDIR") : ::setenv("TMPDIR", oldTemporary.c_str(), 1);
#endif
  }
  // Whether `run` was killed at its `step`-th committed step.
  bool KilledAt(int step, const std::function<void()> &run) {
    stepsLeft = step;
    try {
      run();
    } catch (const Kill &) {
      return true;
    }
    stepsLeft = 0;
    return false;
  }
  // A fresh game with the folders `before` loaded; true when the operation was killed at `step`
  // (0 for none) and the recovery then at `recoveryStep`.
  bool KillAt(int step, int recoveryStep) {
    game = std::make_unique<GameFolder>();
    failures = {};
    game->WithGameFolders().WithCategories("Sounds: N\r\nSkins: S\r\n");
    for (const auto &[folder, files] : kFolders)
      for (const auto &[path, bytes] : files)
        game->Write("ZEP128/" + folder + "/" + NameText(fs::path(path)), bytes);
    for (const auto &[path, bytes] : kOwn)
      game->Write(path, bytes);
    Start();
    for (const std::string &folder : GetParam().before)
      ClickFolder(*selector, folder, failures);
    bool killed = KilledAt(step, [this] {
      if (GetParam().click)
        ClickFolder(*selector, GetParam().click, failures);
      else
        Gathered(selector->ResetAll(selector->ResetAllFiles(failures)), failures);
    });
    if (killed && recoveryStep > 0)
      killed = KilledAt(recoveryStep, [this] { Start(); });
    Start();
    return killed;
  }
  void Start() {
    selector = std::make_unique<Selector>(game->Path(), caption, starter);
    Gathered(selector->StartUp(), failures);
  }
  // The game as the ledger says it must be: each name the copy of the last loaded folder that
  // provides it, else the game's own file, else nothing; record and ledger agree, no journal and
  // no temporary file is left.
  void ExpectAsTheLedgerSays(const std::string &where) {
    const Ledger ledger = Ledger::Read(game->Library() / kKeepingFolder, failures);
    Files expected = kOwn;
    std::set<std::string> loaded;
    for (const LoadedFolder &folder : ledger.Folders()) {
      loaded.insert(folder.name);
      for (const auto &[path, bytes] : kFolders.at(folder.name))
        expected[path] = bytes;
    }
    Files found;
    for (const auto &[folder, files] : kFolders)
      for (const auto &[path, bytes] : files)
        if (game->Exists(path))
          found[path] = game->Read(path);
    EXPECT_EQ(found, expected) << where;
    const std::vector<std::string> names = ReadLoadedNames(LibraryFor(game->Path()), failures);
    EXPECT_EQ(std::set<std::string>(names.begin(), names.end()), loaded) << where;
    EXPECT_FALSE(game->Exists("ZEP128/#Selector/journal.txt")) << where;
    for (const auto &entry : fs::recursive_directory_iterator(game->Path()))
      EXPECT_NE(entry.path().extension(), ".partial") << entry.path() << where;
    // The recovery finishes or undoes the operation without a word: nothing needs mending.
    EXPECT_TRUE(failures.Empty()) << failures.Message("") << where;
  }

  std::unique_ptr<GameFolder> game;
  RecordingCaption caption;
  NotingStarter starter;
  std::unique_ptr<Selector> selector;
  Failures failures;
  std::string oldTemporary;
  int stepsLeft = 0;
};

} // namespace

// A kill after each step of the operation, and then after each step of the recovery.
TEST_P(CrashSteps, EveryKillLeavesTheGameAsTheLedgerSays) {
  for (int step = 1; KillAt(step, 0); ++step)
    for (int recoveryStep = 0; recoveryStep == 0 || KillAt(step, recoveryStep); ++recoveryStep)
      ExpectAsTheLedgerSays(" (killed at step " + std::to_string(step) + ", recovery step " +
                            std::to_string(recoveryStep) + ")");
  ExpectAsTheLedgerSays(" (not killed)");
}

INSTANTIATE_TEST_SUITE_P(Operations, CrashSteps,
                         ::testing::Values(Operation{"LoadKeepingOriginals", {}, "N-A"},
                                           Operation{"LoadOverAnother", {"N-A"}, "N-B"},
                                           Operation{"UnloadPuttingOriginalsBack", {"N-A"}, "N-A"},
                                           Operation{"UnloadOfASharedFile", {"N-A", "N-B"}, "N-A"},
                                           Operation{"LoadOfTheOtherOfALetter", {"S-X"}, "S-Y"},
                                           Operation{"ResetAll", {"N-A", "N-B", "S-X"}, nullptr}),
                         [](const ::testing::TestParamInfo<Operation> &info) {
                           return std::string(info.param.name);
                         });
