#include "base/names.h"
#include "library/reset_all.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

#include <algorithm>

using GridRules = SelectorTest;

// A category letter, and whether it allows several loaded folders at once.
class LetterRule : public SelectorTest,
                   public testing::WithParamInterface<std::pair<char, bool>> {};

TEST_P(LetterRule, ASecondFolderOfTheLetterKeepsOrUnloadsTheFirst) {
  const auto [letter, several] = GetParam();
  const std::string code(1, letter);
  game.WithCategories("Letter " + code + ": " + code + "\r\n");
  game.Write("ZEP128/" + code + "-one/one.dat");
  game.Write("ZEP128/" + code + "-two/two.dat");
  Gather(selector->StartUp());
  Click(code + "-one");
  Click(code + "-two");
  EXPECT_EQ(Mark(code + "-one"), several ? "S" : "");
  EXPECT_EQ(game.Exists("one.dat"), several);
  EXPECT_EQ(Mark(code + "-two"), "S");
  EXPECT_TRUE(failures.Empty()) << failures.Message("");
}

// clang-format off
INSTANTIATE_TEST_SUITE_P(Letters, LetterRule, testing::Values(
    std::pair{'G', true}, std::pair{'N', true}, std::pair{'X', true}, std::pair{'Y', true},
    std::pair{'Z', true}, std::pair{'K', true}, std::pair{'S', false}, std::pair{'F', false},
    std::pair{'B', false}, std::pair{'T', false}, std::pair{'c', false}));
// clang-format on

TEST_F(GridRules, ACampaignUnloadedCarriesHomeItsSaveFilesOnly) {
  game.WithGameFolders().WithCategories("Campaigns: C\r\n");
  game.Write("ZEP128/C first/first.msn");
  game.Write("ZEP128/C-second/second.msn");
  Gather(selector->StartUp());
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
  EXPECT_EQ(selector->ResetAllFiles(failures), expected);
  Gather(selector->ResetAll(expected));
  for (const std::string &name : kept)
    EXPECT_TRUE(game.Exists(name)) << name;
  for (const std::string &name : deleted)
    EXPECT_FALSE(game.Exists(name)) << name;
}
