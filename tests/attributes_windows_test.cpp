// What only Windows has: file attributes, files held open by other programs, names that Windows
// shortens, and its own separator.
#include "app/selector.h"
#include "base/file_ops.h"
#include "base/names.h"
#include "library/loaded_record.h"
#include "library/reset_all.h"
#include "settings/eaw_ini.h"
#include "tests/selector_fixture.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <memory>

namespace {

const std::string kInUse = "in use by another program (is the game running?)";
constexpr DWORD kReadOnly = FILE_ATTRIBUTE_READONLY;
constexpr DWORD kHiddenSystem = FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM;

// Which of `attributes` the file at `path` has.
DWORD WhichOf(DWORD attributes, const fs::path &path) {
  return GetFileAttributesW(path.c_str()) & attributes;
}
void Give(const fs::path &path, DWORD attributes) { SetFileAttributesW(path.c_str(), attributes); }

// A file held open the way another program holds it: no sharing at all.
using Held = std::unique_ptr<void, decltype(&CloseHandle)>;
Held HoldOpen(const fs::path &path) {
  return {CreateFileW(path.c_str(), GENERIC_READ, 0, nullptr, OPEN_EXISTING, 0, nullptr),
          &CloseHandle};
}

class WindowsFiles : public LibraryTest {
protected:
  fs::path InGame(const std::string &name) const { return game.Path() / name; }
};

using WindowsNames = SelectorTest;

} // namespace

TEST_F(WindowsFiles, ReadOnlyHiddenAndSystemFilesAreReplacedAndDeleted) {
  game.Addon("S-One", {"planes.dat", "one.dat", "two.dat"});
  game.Write("planes.dat", "the game's");
  Give(InGame("planes.dat"), kReadOnly | kHiddenSystem);
  Give(game.Library() / "S-One" / "two.dat", kReadOnly);
  Load("S-One");
  EXPECT_EQ(game.Read("planes.dat"), "planes.dat");
  EXPECT_EQ(game.Read("one.dat"), "one.dat");
  // A read-only temporary copy left by an interrupted copy must not block the next one.
  game.Write("one.dat.partial", "half");
  Give(InGame("one.dat.partial"), kReadOnly);
  EXPECT_TRUE(CopyReplacing(game.Library() / "S-One" / "one.dat", InGame("one.dat"), failures));
  EXPECT_FALSE(game.Exists("one.dat.partial"));
  EXPECT_EQ(WhichOf(kReadOnly | FILE_ATTRIBUTE_HIDDEN, InGame("planes.dat")), 0u);
  EXPECT_EQ(WhichOf(kReadOnly, InGame("two.dat")), 0u);

  // Copies made read-only afterwards are still unloaded.
  Give(InGame("one.dat"), kReadOnly);
  Give(InGame("two.dat"), kReadOnly | FILE_ATTRIBUTE_HIDDEN);
  Unload("S-One");
  EXPECT_FALSE(game.Exists("one.dat"));
  // The game's own file was kept like any other, and is back hidden and system as it was.
  EXPECT_EQ(game.Read("planes.dat"), "the game's");
  EXPECT_EQ(WhichOf(kHiddenSystem, InGame("planes.dat")), kHiddenSystem);
}

// Wine lets a file be renamed over a read-only one, which Windows refuses: under Wine this test
// cannot see that the attribute is cleared first for the record, on Windows it can.
TEST_F(WindowsFiles, ReadOnlyFilesAreReplacedOrDeletedAndHiddenOnesKept) {
  game.WithRecord("S-One\r\n\r\n");
  for (const char *name : {"readme.txt", "hidden.dat", "system.dat", "plain.dat"})
    game.Write(name);
  Give(InGame("readme.txt"), kReadOnly);
  Give(InGame("hidden.dat"), FILE_ATTRIBUTE_HIDDEN);
  Give(InGame("system.dat"), FILE_ATTRIBUTE_SYSTEM);
  ResetAll(state, CleanUpNames(state, failures), caption, failures);
  EXPECT_TRUE(game.None({"readme.txt", "plain.dat"}));
  EXPECT_TRUE(game.All({"hidden.dat", "system.dat"}));

  game.WithRecord("old\r\n");
  Give(game.Library() / "FoldersLoaded.txt", kReadOnly);
  SaveLoaded(state, failures);
  EXPECT_EQ(game.Record(), "\r\n");
  game.Write("eaw.ini", "Width=1\r\n");
  Give(InGame("eaw.ini"), kReadOnly | kHiddenSystem);
  inisave(game.Path(), {"640"}, failures);
  EXPECT_EQ(game.Read("eaw.ini"), "Width=640\r\n");
  EXPECT_EQ(WhichOf(kReadOnly | kHiddenSystem, InGame("eaw.ini")), kHiddenSystem);
}

TEST_F(WindowsFiles, ASourceHeldOpenLeavesTheFilesItWouldReplaceAsTheyWere) {
  game.Write("source.dat", "new");
  game.Write("target.dat", "old");
  const Held held = HoldOpen(InGame("source.dat"));
  ASSERT_NE(held.get(), INVALID_HANDLE_VALUE);
  EXPECT_FALSE(CopyJournaled(InGame("source.dat"), InGame("target.dat"), failures));
  EXPECT_FALSE(CopyJournaled(InGame("source.dat"), InGame("free.dat"), failures));
  EXPECT_EQ(game.Read("target.dat"), "old");
  EXPECT_TRUE(game.None({"free.dat", "target.dat.partial"}));
  EXPECT_EQ(Taken().Lines().size(), 2u);
}

TEST_F(WindowsFiles, AFileHeldOpenIsSkippedNamedAndLeftAsItWas) {
  game.Addon("S-Held", {"held.dat", "free.dat"});
  game.Addon("S-Two", {"two.dat"});
  game.Write("held.dat", "the game's");
  Load("S-Two");
  {
    const Held held = HoldOpen(InGame("held.dat"));
    ASSERT_NE(held.get(), INVALID_HANDLE_VALUE);
    Load("S-Held");
    EXPECT_EQ(game.Read("free.dat"), "free.dat");
    EXPECT_FALSE(game.Exists("held.dat.partial"));
    ASSERT_TRUE(OneFailure(failures, kInUse));
    EXPECT_TRUE(Contains(Taken().Lines()[0], "held.dat"));
  }
  EXPECT_EQ(game.Read("held.dat"), "the game's");

  // The game's own held.dat was not replaced, so the unload leaves it alone; the copy free.dat is
  // held open now, and taken out at the next unload.
  Give(InGame("free.dat"), kReadOnly);
  game.WithRecord("kept\r\n");
  Failures later;
  {
    const Held held = HoldOpen(InGame("free.dat"));
    const Held record = HoldOpen(game.Library() / "FoldersLoaded.txt");
    MoveOut(state, game.Library() / "S-Held", caption, later);
  }
  EXPECT_EQ(game.Read("held.dat"), "the game's");
  EXPECT_TRUE(game.Exists("free.dat"));
  EXPECT_EQ(WhichOf(kReadOnly, InGame("free.dat")), kReadOnly);
  EXPECT_EQ(game.Record(), "kept\r\n");
  EXPECT_FALSE(game.Exists("ZEP128/FoldersLoaded.txt.partial"));
  EXPECT_EQ(later.Lines().size(), 2u) << later.Message("");
  for (const std::string &line : later.Lines())
    EXPECT_TRUE(Contains(line, kInUse));
  EXPECT_TRUE(Contains(later.Message(""), "free.dat"));
  Unload("S-Two");
  EXPECT_FALSE(game.Exists("free.dat"));
}

TEST_F(WindowsNames, MusicSetsWithTrailingBlanksAndDotsFindTheirFolders) {
  game.Write("Music.ini", "Set1 \r\nSet2.\r\nSet3\r\n");
  game.Write("Set1/one.bgm");
  game.Write("Set2/two.bgm");
  game.Write("Music/three.bgm");
  const MusicList music = selector->MusicSets(failures);
  EXPECT_EQ(music.entries, (Names{"Set1 ", "Set2."}));
  EXPECT_EQ(music.current, "Set3");
  EXPECT_TRUE(Gather(selector->SwitchMusic("Set3", "Set1 ")).done);
  EXPECT_TRUE(game.All({"Music/one.bgm", "Set3/three.bgm"}));
}

TEST_F(WindowsFiles, PathsAreShownWithWindowsSeparators) {
  EXPECT_EQ(DisplayPath(fs::path("C:/Games/EAW") / "ZEP128"), "C:\\Games\\EAW\\ZEP128");
  game.Addon("S-One", {"one.dat"});
  game.MakeFolder("one.dat/in the way");
  // The game folder as Qt hands it over, with "/" between names.
  state = LibraryFor(fs::path(game.Path()).generic_wstring());
  MoveIn(state, state.LibDir / "S-One", caption, failures);
  ASSERT_TRUE(OneFailure(failures, "one.dat"));
  EXPECT_EQ(Taken().Lines()[0].find('/'), std::string::npos);
}
