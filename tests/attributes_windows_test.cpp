// What only Windows has: file attributes, files held open by other programs, names that Windows
// shortens, and its own separator.
#include "app/selector.h"
#include "base/file_ops.h"
#include "base/names.h"
#include "library/loaded_record.h"
#include "library/move_in.h"
#include "library/move_out.h"
#include "library/reset_all.h"
#include "settings/eaw_ini.h"
#include "tests/selector_fixture.h"

#include <windows.h>

#include <gtest/gtest.h>

namespace fs = std::filesystem;

namespace {

const std::string kInUse = "in use by another program (is the game running?)";

DWORD Attributes(const fs::path &path) { return GetFileAttributesW(path.c_str()); }
bool Has(const fs::path &path, DWORD attribute) { return (Attributes(path) & attribute) != 0; }
void Give(const fs::path &path, DWORD attributes) { SetFileAttributesW(path.c_str(), attributes); }

// A file held open the way another program holds it: no sharing at all.
class HeldOpen {
public:
  explicit HeldOpen(const fs::path &path)
      : handle_(CreateFileW(path.c_str(), GENERIC_READ, 0, nullptr, OPEN_EXISTING, 0, nullptr)) {}
  ~HeldOpen() { CloseHandle(handle_); }
  bool Held() const { return handle_ != INVALID_HANDLE_VALUE; }

private:
  HANDLE handle_;
};

class WindowsFiles : public ::testing::Test {
protected:
  void Load(const std::string &name) { MoveIn(state, game.Library() / name, caption, failures); }
  void Unload(const std::string &name) { MoveOut(state, game.Library() / name, caption, failures); }
  fs::path InGame(const std::string &name) const { return game.Path() / name; }

  GameFolder game;
  LibraryState state = LibraryFor(game.Path());
  RecordingCaption caption;
  Failures failures;
};

} // namespace

TEST_F(WindowsFiles, ReadOnlyHiddenAndSystemFilesAreReplacedAndDeleted) {
  game.Addon("S-One", {"planes.dat", "one.dat", "two.dat"});
  game.Write("planes.dat", "the game's");
  Give(InGame("planes.dat"),
       FILE_ATTRIBUTE_READONLY | FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM);
  Give(game.Library() / "S-One" / "two.dat", FILE_ATTRIBUTE_READONLY);
  Load("S-One");
  EXPECT_EQ(game.Read("planes.dat"), "planes.dat");
  EXPECT_EQ(game.Read("one.dat"), "one.dat");
  // A read-only temporary copy left by an interrupted copy must not block the next one.
  game.Write("one.dat.partial", "half");
  Give(InGame("one.dat.partial"), FILE_ATTRIBUTE_READONLY);
  EXPECT_TRUE(CopyReplacing(game.Library() / "S-One" / "one.dat", InGame("one.dat"), failures));
  EXPECT_FALSE(game.Exists("one.dat.partial"));
  EXPECT_FALSE(Has(InGame("planes.dat"), FILE_ATTRIBUTE_READONLY | FILE_ATTRIBUTE_HIDDEN));
  EXPECT_FALSE(Has(InGame("two.dat"), FILE_ATTRIBUTE_READONLY));
  EXPECT_TRUE(failures.Empty()) << failures.Message("");

  // Copies made read-only afterwards are still unloaded.
  Give(InGame("one.dat"), FILE_ATTRIBUTE_READONLY);
  Give(InGame("two.dat"), FILE_ATTRIBUTE_READONLY | FILE_ATTRIBUTE_HIDDEN);
  Unload("S-One");
  EXPECT_FALSE(game.Exists("one.dat"));
  // The game's own file was kept like any other, and is back hidden and system as it was.
  EXPECT_EQ(game.Read("planes.dat"), "the game's");
  EXPECT_TRUE(Has(InGame("planes.dat"), FILE_ATTRIBUTE_HIDDEN));
  EXPECT_TRUE(Has(InGame("planes.dat"), FILE_ATTRIBUTE_SYSTEM));
  EXPECT_TRUE(failures.Empty()) << failures.Message("");
}

TEST_F(WindowsFiles, ACopyHeldOpenAtItsUnloadIsTakenOutAtTheNextOne) {
  game.Addon("S-One", {"one.dat"});
  game.Addon("S-Two", {"two.dat"});
  Load("S-One");
  Load("S-Two");
  {
    const HeldOpen held(InGame("one.dat"));
    ASSERT_TRUE(held.Held());
    Unload("S-One");
    EXPECT_TRUE(game.Exists("one.dat"));
  }
  EXPECT_NE(failures.Message("").find("one.dat"), std::string::npos);
  Unload("S-Two");
  EXPECT_FALSE(game.Exists("one.dat"));
}

TEST_F(WindowsFiles, ResetAllDeletesReadOnlyFilesAndKeepsHiddenOnes) {
  game.WithRecord("S-One\r\n\r\n");
  for (const char *name : {"readme.txt", "hidden.dat", "system.dat", "plain.dat"})
    game.Write(name);
  Give(InGame("readme.txt"), FILE_ATTRIBUTE_READONLY);
  Give(InGame("hidden.dat"), FILE_ATTRIBUTE_HIDDEN);
  Give(InGame("system.dat"), FILE_ATTRIBUTE_SYSTEM);
  ResetAll(state, CleanUpNames(state, failures), caption, failures);
  EXPECT_FALSE(game.Exists("readme.txt"));
  EXPECT_FALSE(game.Exists("plain.dat"));
  EXPECT_TRUE(game.Exists("hidden.dat"));
  EXPECT_TRUE(game.Exists("system.dat"));
  EXPECT_TRUE(failures.Empty()) << failures.Message("");
}

// Wine lets a file be renamed over a read-only one, which Windows refuses: under Wine this test
// cannot see that the attribute is cleared first, on Windows it can.
TEST_F(WindowsFiles, ReadOnlyRecordAndSettingsAreReplacedKeepingHiddenAndSystem) {
  game.WithRecord("old\r\n");
  Give(game.Library() / "FoldersLoaded.txt", FILE_ATTRIBUTE_READONLY);
  SaveLoaded(state, failures);
  EXPECT_EQ(game.Record(), "\r\n");
  game.Write("eaw.ini", "Width=1\r\n");
  Give(InGame("eaw.ini"), FILE_ATTRIBUTE_READONLY | FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM);
  inisave(game.Path(), {"640"}, failures);
  EXPECT_EQ(game.Read("eaw.ini"), "Width=640\r\n");
  EXPECT_TRUE(Has(InGame("eaw.ini"), FILE_ATTRIBUTE_HIDDEN));
  EXPECT_TRUE(Has(InGame("eaw.ini"), FILE_ATTRIBUTE_SYSTEM));
  EXPECT_FALSE(Has(InGame("eaw.ini"), FILE_ATTRIBUTE_READONLY));
  EXPECT_TRUE(failures.Empty()) << failures.Message("");
}

TEST_F(WindowsFiles, ASourceHeldOpenLeavesTheFilesItWouldReplaceAsTheyWere) {
  game.Write("source.dat", "new");
  game.Write("target.dat", "old");
  HeldOpen held(InGame("source.dat"));
  ASSERT_TRUE(held.Held());
  EXPECT_FALSE(CopyJournaled(InGame("source.dat"), InGame("target.dat"), failures));
  EXPECT_FALSE(CopyJournaled(InGame("source.dat"), InGame("free.dat"), failures));
  EXPECT_EQ(game.Read("target.dat"), "old");
  EXPECT_FALSE(game.Exists("free.dat"));
  EXPECT_FALSE(game.Exists("target.dat.partial"));
  EXPECT_EQ(failures.Lines().size(), 2u);
}

TEST_F(WindowsFiles, AFileHeldOpenIsSkippedNamedAndLeftAsItWas) {
  game.Addon("S-Held", {"held.dat", "free.dat"});
  game.Write("held.dat", "the game's");
  {
    HeldOpen held(InGame("held.dat"));
    ASSERT_TRUE(held.Held());
    Load("S-Held");
    EXPECT_EQ(game.Read("free.dat"), "free.dat");
    EXPECT_FALSE(game.Exists("held.dat.partial"));
    ASSERT_EQ(failures.Lines().size(), 1u);
    EXPECT_NE(failures.Lines()[0].find("held.dat"), std::string::npos);
    EXPECT_NE(failures.Lines()[0].find(kInUse), std::string::npos) << failures.Lines()[0];
  }
  EXPECT_EQ(game.Read("held.dat"), "the game's");

  // The game's own held.dat was not replaced, so the unload leaves it alone; the copy free.dat is
  // held open now.
  Give(InGame("free.dat"), FILE_ATTRIBUTE_READONLY);
  game.WithRecord("kept\r\n");
  Failures later;
  {
    HeldOpen held(InGame("free.dat"));
    HeldOpen record(game.Library() / "FoldersLoaded.txt");
    MoveOut(state, game.Library() / "S-Held", caption, later);
  }
  EXPECT_EQ(game.Read("held.dat"), "the game's");
  EXPECT_TRUE(game.Exists("free.dat"));
  EXPECT_TRUE(Has(InGame("free.dat"), FILE_ATTRIBUTE_READONLY));
  EXPECT_EQ(game.Record(), "kept\r\n");
  EXPECT_FALSE(game.Exists("ZEP128/FoldersLoaded.txt.partial"));
  EXPECT_EQ(later.Lines().size(), 2u) << later.Message("");
  for (const std::string &line : later.Lines())
    EXPECT_NE(line.find(kInUse), std::string::npos) << line;
}

TEST(WindowsNames, MusicSetsWithTrailingBlanksAndDotsFindTheirFolders) {
  GameFolder game;
  game.Write("Music.ini", "Set1 \r\nSet2.\r\nSet3\r\n");
  game.Write("Set1/one.bgm");
  game.Write("Set2/two.bgm");
  game.Write("Music/three.bgm");
  RecordingCaption caption;
  NotingStarter starter;
  Selector selector(game.Path(), caption, starter);
  Failures failures;
  const MusicList music = selector.MusicSets(failures);
  EXPECT_EQ(music.entries, (std::vector<std::string>{"Set1 ", "Set2."}));
  EXPECT_EQ(music.current, "Set3");
  EXPECT_TRUE(Gathered(selector.SwitchMusic("Set3", "Set1 "), failures).done);
  EXPECT_TRUE(game.Exists("Music/one.bgm"));
  EXPECT_TRUE(game.Exists("Set3/three.bgm"));
  EXPECT_TRUE(failures.Empty()) << failures.Message("");
}

TEST(WindowsNames, PathsAreShownWithWindowsSeparators) {
  EXPECT_EQ(DisplayPath(fs::path("C:/Games/EAW") / "ZEP128"), "C:\\Games\\EAW\\ZEP128");
  GameFolder game;
  game.Addon("S-One", {"one.dat"});
  game.MakeFolder("one.dat/in the way");
  // The game folder as Qt hands it over, with "/" between names.
  LibraryState state = LibraryFor(fs::path(game.Path()).generic_wstring());
  RecordingCaption caption;
  Failures failures;
  MoveIn(state, state.LibDir / "S-One", caption, failures);
  ASSERT_EQ(failures.Lines().size(), 1u);
  EXPECT_EQ(failures.Lines()[0].find('/'), std::string::npos) << failures.Lines()[0];
}
