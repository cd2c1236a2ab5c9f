#include "app/category_file.h"
#include "base/links.h"
#include "base/names.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace {

// A started game with one loadable folder, and files outside the game folder that links point
// at, one of them read-only in a folder.
class Links : public SelectorTest {
protected:
  void SetUp() override {
    game.WithGameFolders().WithCategories("Sounds: N\r\n").WithRecord("");
    game.Addon("N-One", {"bases.dat", "a.msn", "x.bgm"});
    game.Write("bases.dat", "the game's own");
    game.Write("eaw.ini", "Width=800\r\n");
    game.Write("Music.ini", "Set1\r\nSet2\r\n");
    game.Write("Set1/a.bgm");
    game.MakeFolder("ZEP128/#Selector/originals");
    SetReadOnly(outside.Write("dir/bases.dat", "outside"), true);
    outside.Write("target.txt", "outside");
    before = Snapshot(outside.Path());
    Gather(selector->StartUp());
  }
  // A link at `relative` in the game folder to the outside file; false when it cannot be made.
  bool Plant(const std::string &relative) const {
    std::error_code error;
    fs::create_symlink(outside.Path() / "dir/bases.dat", game.Path() / relative, error);
    return !error;
  }

  TestFolder outside;
  std::map<std::string, std::string> before;
};

// One whose folder `GetParam()`, where the program keeps or writes things, is a link to the
// outside folder.
class FolderLink : public Links, public ::testing::WithParamInterface<const char *> {};

} // namespace

TEST_P(FolderLink, IsNamedAndNothingIsWrittenMovedOrChangedThroughIt) {
  const fs::path link = Child(game.Path(), GetParam());
  fs::remove_all(link);
  if (!MakeFolderLink(outside.Path() / "dir", link))
    GTEST_SKIP() << "this system lets the test make no folder link";
  // A Reset All cut short, whose recovery puts the kept originals back.
  game.Write("ZEP128/#Selector/journal.txt", "restore\r\n\r\n");
  before = Snapshot(outside.Path());
  Restart();
  Gather(selector->ClickRow(0));
  Gather(selector->ClickRow(0));
  Gather(selector->ResetAll(selector->ResetAllFiles(failures)));
  Gather(selector->SwitchMusic("Set2", "Set1"));
  EXPECT_EQ(Snapshot(outside.Path()), before);
  EXPECT_TRUE(IsLink(link));
  const Failures refused = Taken();
  EXPECT_TRUE(std::ranges::any_of(refused.Lines(), [&](const std::string &line) {
    return Contains(line, DisplayPath(link)) && Contains(line, "is a link");
  })) << refused.Message("");
}

INSTANTIATE_TEST_SUITE_P(WhereThingsAreKept, FolderLink,
                         ::testing::Values("ZEP128/#Selector", "ZEP128/#Selector/originals",
                                           "ZEP128/#Selector/originals/G", "Savedata", "Music",
                                           "ZEP128/N-One", "Set1"));

TEST_F(Links, ACampaignThatBecameALinkIsUnloadedAndItsSavedGamesStay) {
  game.WithCategories("Campaigns: C\r\n").Addon("C-One", {"m.msn"});
  Restart();
  Gather(selector->ClickRow(0));
  game.Write("Savedata/game.sve", "progress");
  fs::rename(game.Path() / "ZEP128/C-One", outside.Path() / "C-One");
  if (!MakeFolderLink(outside.Path() / "C-One", game.Path() / "ZEP128/C-One"))
    GTEST_SKIP() << "this system lets the test make no folder link";
  before = Snapshot(outside.Path());
  Gather(selector->ClickRow(0));
  EXPECT_EQ(Snapshot(outside.Path()), before);
  EXPECT_EQ(game.Read("Savedata/game.sve"), "progress");
  EXPECT_FALSE(game.Exists("Savedata/m.msn"));
  EXPECT_TRUE(OneFailure(Taken(), "the saved games stay in Savedata"));
}

// Links to files only where a program may make them: Wine shows one as the file it names.
#ifndef _WIN32
TEST_F(Links, TemporaryNamesPlantedAsLinksAreNeverWrittenThrough) {
  for (const char *name :
       {"bases.dat.partial", "ZEP128/FoldersLoaded.txt.partial", "eaw.ini.partial",
        "ZEP128/#Selector/loaded.txt.partial", "ZEP128/#Selector/journal.txt.partial",
        "ZEP128/#Selector/music.txt.partial", "ZEP128/zep.ini.partial"})
    ASSERT_TRUE(Plant(name)) << name;
  Gather(selector->ClickRow(0));
  Gather(selector->SaveSettings({"1024"}));
  EXPECT_TRUE(Gather(selector->SwitchMusic("Set2", "Set1")).done);
  fs::remove(game.Path() / "ZEP128/zep.ini");
  Gather(selector->RefreshLibrary());
  EXPECT_EQ(game.Read("ZEP128/zep.ini"), DefaultCategoryText());
  EXPECT_EQ(game.Read("bases.dat"), "bases.dat");
  EXPECT_EQ(game.Record(), "N-One\r\n\r\n");
  EXPECT_EQ(game.Read("eaw.ini"), "Width=1024\r\n");
  EXPECT_EQ(Snapshot(outside.Path()), before);
}

TEST_F(Links, LinkedFilesAreRefusedAndWhatTheyPointAtStaysAsItWas) {
  ASSERT_TRUE(Plant("ZEP128/N-One/linked.dat"));
  fs::remove(game.Path() / "eaw.ini");
  ASSERT_TRUE(Plant("eaw.ini"));
  Gather(selector->ClickRow(0));
  Gather(selector->SaveSettings({"1024"}));
  EXPECT_FALSE(Gather(selector->SaveSettingsFile("Width=1")).done);
  EXPECT_FALSE(game.Exists("linked.dat"));
  EXPECT_TRUE(fs::is_symlink(game.Path() / "eaw.ini"));
  EXPECT_EQ(Snapshot(outside.Path()), before);
  ASSERT_EQ(failures.Lines().size(), 3u) << failures.Message("");
  EXPECT_TRUE(Contains(failures.Lines()[0], "linked.dat"));
  EXPECT_TRUE(Contains(Taken().Lines()[0], "link"));
}

TEST_F(Links, LinkedSetupsAreNeitherReadNorWrittenNorDeleted) {
  fs::create_directories(game.Path() / "ZEP128/#Selector/setups");
  ASSERT_TRUE(Plant("ZEP128/#Selector/setups/linked.txt"));
  EXPECT_EQ(Gather(selector->SwitchToSetup("linked")).notice, "");
  EXPECT_TRUE(Contains(Taken().HeadingOr(""), "it is a link"));
  fs::remove_all(game.Path() / "ZEP128/#Selector/setups");
  fs::create_directory_symlink(outside.Path(), game.Path() / "ZEP128/#Selector/setups");
  EXPECT_EQ(selector->Setups(), Names{});
  EXPECT_FALSE(Gather(selector->SaveSetup("target")).done);
  EXPECT_FALSE(Gather(selector->ResetAll({})).summary); // no way back, so nothing reset
  EXPECT_FALSE(Gather(selector->DeleteSetup("target")).done);
  EXPECT_EQ(Gather(selector->SwitchToSetup("target")).notice, "");
  EXPECT_EQ(Snapshot(outside.Path()), before);
  EXPECT_TRUE(Contains(Taken().Message(""), "is a link"));
}

TEST_F(Links, APlaceForTheGamesOwnFileTakenByALinkLoopLeavesThatFileAlone) {
  game.MakeFolder("ZEP128/#Selector/originals/G");
  fs::create_symlink("bases.dat", game.Path() / "ZEP128/#Selector/originals/G/bases.dat");
  Gather(selector->ClickRow(0));
  EXPECT_EQ(game.Read("bases.dat"), "the game's own");
  EXPECT_TRUE(Contains(Taken().Message(""), "bases.dat"));
}
#endif
