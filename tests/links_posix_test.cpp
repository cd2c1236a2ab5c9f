#include "app/category_file.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace fs = std::filesystem;

namespace {

// A game with one loadable folder, and a file outside the game folder that links point at.
class Links : public SelectorTest {
protected:
  void SetUp() override {
    game.WithGameFolders().WithCategories("Skins: S\r\n").WithRecord("");
    game.Addon("S-One", {"planes.dat"});
    game.Write("eaw.ini", "Width=800\r\n");
    game.Write("Music.ini", "Set1\r\nSet2\r\n");
    game.Write("Set1/a.bgm");
    outside.Write("target.txt", "outside");
    Gather(selector->StartUp());
  }
  // A link at `relative` in the game folder to the outside file; false when it cannot be made.
  bool Plant(const std::string &relative) {
    std::error_code error;
    fs::create_symlink(outside.Path() / "target.txt", game.Path() / relative, error);
    return !error;
  }
  void ExpectOutsideUntouched() const {
    EXPECT_EQ(outside.Read("target.txt"), "outside");
    EXPECT_TRUE(IsWritable(outside.Path() / "target.txt") == outsideWritable);
  }

  TestFolder outside;
  bool outsideWritable = true;
};

} // namespace

TEST_F(Links, TemporaryNamesPlantedAsLinksAreNeverWrittenThrough) {
  for (const char *name :
       {"planes.dat.partial", "ZEP128/FoldersLoaded.txt.partial", "eaw.ini.partial",
        "ZEP128/#Selector/loaded.txt.partial", "ZEP128/#Selector/journal.txt.partial",
        "ZEP128/#Selector/music.txt.partial", "ZEP128/zep.ini.partial"}) {
    game.MakeFolder("ZEP128/#Selector");
    ASSERT_TRUE(Plant(name)) << name;
  }
  Gather(selector->ClickRow(0));
  Gather(selector->SaveSettings({"1024"}));
  EXPECT_TRUE(Gather(selector->SwitchMusic("Set2", "Set1")).done);
  fs::remove(game.Path() / "ZEP128/zep.ini");
  Gather(selector->RefreshLibrary());
  EXPECT_EQ(game.Read("ZEP128/zep.ini"), DefaultCategoryText());
  EXPECT_EQ(game.Read("planes.dat"), "planes.dat");
  EXPECT_EQ(game.Record(), "S-One\r\n\r\n");
  EXPECT_EQ(game.Read("eaw.ini"), "Width=1024\r\n");
  ExpectOutsideUntouched();
  EXPECT_TRUE(failures.Empty()) << failures.Message("");
}

TEST_F(Links, LinkedFilesAreRefusedAndWhatTheyPointAtStaysAsItWas) {
  SetReadOnly(outside.Path() / "target.txt", true);
  outsideWritable = false;
  ASSERT_TRUE(Plant("ZEP128/S-One/linked.dat"));
  fs::remove(game.Path() / "eaw.ini");
  ASSERT_TRUE(Plant("eaw.ini"));
  Gather(selector->ClickRow(0));
  Gather(selector->SaveSettings({"1024"}));
  EXPECT_FALSE(Gather(selector->SaveSettingsFile("Width=1")).done);
  EXPECT_FALSE(game.Exists("linked.dat"));
  EXPECT_TRUE(fs::is_symlink(game.Path() / "eaw.ini"));
  ExpectOutsideUntouched();
  ASSERT_EQ(failures.Lines().size(), 3u) << failures.Message("");
  EXPECT_NE(failures.Lines()[0].find("linked.dat"), std::string::npos);
  EXPECT_NE(failures.Lines()[0].find("link"), std::string::npos);
}

TEST_F(Links, LinkedSetupsAreNeitherReadNorWrittenNorDeleted) {
  fs::create_directories(game.Path() / "ZEP128/#Selector/setups");
  ASSERT_TRUE(Plant("ZEP128/#Selector/setups/linked.txt"));
  EXPECT_EQ(Gather(selector->SwitchToSetup("linked")).notice, "");
  EXPECT_NE(failures.HeadingOr("").find("it is a link"), std::string::npos);
  fs::remove_all(game.Path() / "ZEP128/#Selector/setups");
  fs::create_directory_symlink(outside.Path(), game.Path() / "ZEP128/#Selector/setups");
  EXPECT_EQ(selector->Setups(), std::vector<std::string>{});
  EXPECT_FALSE(Gather(selector->SaveSetup("target")).done);
  EXPECT_FALSE(Gather(selector->ResetAll({})).summary); // no way back, so nothing reset
  EXPECT_FALSE(Gather(selector->DeleteSetup("target")).done);
  EXPECT_EQ(Gather(selector->SwitchToSetup("target")).notice, "");
  ExpectOutsideUntouched();
}

TEST_F(Links, APlaceForTheGamesOwnFileTakenByALinkLoopLeavesThatFileAlone) {
  game.Write("planes.dat", "own");
  game.MakeFolder("ZEP128/#Selector/originals/G");
  fs::create_symlink("planes.dat", game.Path() / "ZEP128/#Selector/originals/G/planes.dat");
  Gather(selector->ClickRow(0));
  EXPECT_EQ(game.Read("planes.dat"), "own");
  EXPECT_NE(failures.Message("").find("planes.dat"), std::string::npos);
}
