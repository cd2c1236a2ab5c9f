#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

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
  EXPECT_TRUE(game.None({"Savedata/pilot1.sve", "Savedata/PILOT2.SVE", "Savedata/second.msn",
                         "ZEP128/C-second/pilot1.sve", "ZEP128/C-second/mine.msn"}));
  EXPECT_EQ(game.Read("Savedata/mine.msn"), "the player's");
  EXPECT_EQ(game.Record(), "\r\n");
}
