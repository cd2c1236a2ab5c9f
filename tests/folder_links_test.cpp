#include "base/links.h"
#include "base/names.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace fs = std::filesystem;

namespace {

// Links to files are tested in links_posix_test.cpp only: Wine shows one as the file it names.
// A game whose folder `GetParam()`, one where the program keeps or writes things, is a link to a
// folder outside the game folder that holds a read-only file.
class FolderLink : public SelectorTest, public ::testing::WithParamInterface<const char *> {
protected:
  void SetUp() override {
    game.WithGameFolders().WithCategories("Sounds: N\r\n").WithRecord("");
    game.Addon("N-One", {"bases.dat", "a.msn", "x.bgm"});
    game.Write("bases.dat", "the game's own");
    game.Write("Music.ini", "Set1\r\nSet2\r\n");
    game.Write("Set1/a.bgm");
    game.MakeFolder("ZEP128/#Selector/originals");
    SetReadOnly(outside.Write("dir/bases.dat", "outside"), true);
  }

  TestFolder outside;
};

} // namespace

TEST_P(FolderLink, IsNamedAndNothingIsWrittenMovedOrChangedThroughIt) {
  const fs::path link = Child(game.Path(), GetParam());
  fs::remove_all(link);
  if (!MakeFolderLink(outside.Path() / "dir", link))
    GTEST_SKIP() << "this system lets the test make no folder link";
  // A Reset All cut short, whose recovery puts the kept originals back.
  game.Write("ZEP128/#Selector/journal.txt", "restore\r\n\r\n");
  const std::map<std::string, std::string> before = Snapshot(outside.Path());
  Gather(selector->StartUp());
  Gather(selector->ClickRow(0));
  Gather(selector->ClickRow(0));
  Gather(selector->ResetAll(selector->ResetAllFiles(failures)));
  Gather(selector->SwitchMusic("Set2", "Set1"));
  EXPECT_EQ(Snapshot(outside.Path()), before);
  EXPECT_TRUE(IsLink(link));
  EXPECT_TRUE(std::any_of(failures.Lines().begin(), failures.Lines().end(),
                          [&](const std::string &line) {
                            return line.find(DisplayPath(link)) != line.npos &&
                                   line.find("is a link") != line.npos;
                          }))
      << failures.Message("");
}

INSTANTIATE_TEST_SUITE_P(WhereThingsAreKept, FolderLink,
                         ::testing::Values("ZEP128/#Selector", "ZEP128/#Selector/originals",
                                           "ZEP128/#Selector/originals/G", "Savedata", "Music",
                                           "ZEP128/N-One", "Set1"));

TEST_F(FolderLink, ACampaignThatBecameALinkIsUnloadedAndItsSavedGamesStay) {
  game.WithCategories("Campaigns: C\r\n").Addon("C-One", {"m.msn"});
  Gather(selector->StartUp());
  Gather(selector->ClickRow(0));
  game.Write("Savedata/game.sve", "progress");
  fs::rename(game.Path() / "ZEP128/C-One", outside.Path() / "C-One");
  if (!MakeFolderLink(outside.Path() / "C-One", game.Path() / "ZEP128/C-One"))
    GTEST_SKIP() << "this system lets the test make no folder link";
  const std::map<std::string, std::string> before = Snapshot(outside.Path());
  Gather(selector->ClickRow(0));
  EXPECT_EQ(Snapshot(outside.Path()), before);
  EXPECT_EQ(game.Read("Savedata/game.sve"), "progress");
  EXPECT_FALSE(game.Exists("Savedata/m.msn"));
  ASSERT_EQ(failures.Lines().size(), 1u) << failures.Message("");
  EXPECT_NE(failures.Lines()[0].find("the saved games stay in Savedata"), std::string::npos);
}
