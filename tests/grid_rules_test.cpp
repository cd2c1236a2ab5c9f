#include "base/names.h"
#include "library/reset_all.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

#include <algorithm>

using Names = std::vector<std::string>;

namespace {

class GridRules : public SelectorTest {
protected:
  void Click(const std::string &folder) {
    selector.ClickRow(RowOf(selector.State().Unigrid, folder), failures);
  }
  std::string Mark(const std::string &folder) const {
    const FolderGrid &grid = selector.State().Unigrid;
    return grid.Row(RowOf(grid, folder)).mark;
  }
};

} // namespace

TEST_F(GridRules, ASecondFolderOfALetterKeepsOrUnloadsTheFirst) {
  // clang-format off
  const std::pair<char, bool> letters[] = {
      {'G', true}, {'N', true}, {'X', true}, {'Y', true}, {'Z', true}, {'K', true},
      {'S', false}, {'F', false}, {'B', false}, {'T', false}, {'c', false}};
  // clang-format on
  std::string categories;
  for (const auto &[letter, several] : letters) {
    categories += std::string("Letter ") + letter + ": " + letter + "\r\n";
    for (const char *which : {"one", "two"})
      game.Write(std::string("ZEP128/") + letter + "-" + which + "/" + letter + which + ".dat");
  }
  game.WithCategories(categories);
  selector.StartUp(failures);
  for (const auto &[letter, several] : letters) {
    const std::string one = std::string(1, letter) + "-one", two = std::string(1, letter) + "-two";
    Click(one);
    Click(two);
    EXPECT_EQ(Mark(one), several ? "S" : "") << letter;
    EXPECT_EQ(game.Exists(std::string(1, letter) + "one.dat"), several) << letter;
    EXPECT_EQ(Mark(two), "S") << letter;
  }
  EXPECT_TRUE(failures.Empty()) << failures.Message("");
}

TEST_F(GridRules, ACampaignUnloadedCarriesHomeItsSaveFilesOnly) {
  game.WithGameFolders().WithCategories("Campaigns: C\r\n");
  game.Write("ZEP128/C first/first.msn");
  game.Write("ZEP128/C-second/second.msn");
  selector.StartUp(failures);
  Click("C first");
  game.Write("Savedata/pilot1.sve", "career");
  game.Write("Savedata/mine.msn", "the player's");
  Click("C-second"); // the other campaign is unloaded first
  EXPECT_EQ(game.Read("ZEP128/C first/pilot1.sve"), "career");
  EXPECT_FALSE(game.Exists("Savedata/first.msn"));
  game.Write("Savedata/PILOT2.SVE", "career 2");
  Click("C-second");
  EXPECT_EQ(game.Read("ZEP128/C-second/PILOT2.SVE"), "career 2");
  for (const char *gone : {"Savedata/pilot1.sve", "Savedata/PILOT2.SVE", "Savedata/second.msn",
                           "ZEP128/C-second/pilot1.sve", "ZEP128/C-second/mine.msn"})
    EXPECT_FALSE(game.Exists(gone)) << gone;
  EXPECT_EQ(game.Read("Savedata/mine.msn"), "the player's");
  EXPECT_EQ(game.Record(), "\r\n");
}

TEST_F(GridRules, ResetAllHonoursEveryDefaultPattern) {
  // One name per default pattern ("P.bmp": a star matching an empty run), and names that only
  // look alike. (".bgm" would do too, but Wine hides names that start with a dot.)
  const Names deleted = {"a.bgm",    "a.fnt",   "a.wsd", "a.fsp", "a.pal", "a.bak", "a.tco",
                         "a.pco",    "a.bco",   "a.hm",  "a.jpg", "a.pcx", "a.txt", "mypic",
                         "planepic", "skinpic", "a.mnu", "a.dat", "a.mpc", "a.wsp", "a.pic",
                         "a.spt",    "a.str",   "a.ter", "a.tm",  "a.tpc", "a.flt", "a.3dz",
                         "a.snd",    "a.bil",   "a.bin", "a.cpt", "P.bmp", "a.smk"};
  const Names kept = {"title.bmp", "mypicture", "a.tmx", "eaw.exe", "Hof.Dat"};
  for (const std::string &name : deleted)
    game.Write(name);
  for (const std::string &name : kept)
    game.Write(name);
  game.WithRecord("");
  Names expected = deleted;
  std::sort(expected.begin(), expected.end(),
            [](const std::string &a, const std::string &b) { return NameLess(a, b); });
  EXPECT_EQ(selector.ResetAllFiles(failures), expected);
  selector.ResetAll(expected, failures);
  for (const std::string &name : kept)
    EXPECT_TRUE(game.Exists(name)) << name;
  for (const std::string &name : deleted)
    EXPECT_FALSE(game.Exists(name)) << name;
}
