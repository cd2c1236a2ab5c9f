#include "app/category_file.h"
#include "app/startup.h"
#include "base/text_file.h"
#include "tests/game_folder.h"

#include <gtest/gtest.h>

using Lines = std::vector<std::string>;

TEST(CategoryFile, DefaultFileIsWrittenOnceByteForByte) {
  const std::string text = DefaultCategoryText();
  EXPECT_EQ(SplitLines(text).size(), 27u);
  EXPECT_EQ(text.substr(0, 28), "Versions of the EAW.exe: E\r\n");
  EXPECT_EQ(text.substr(text.size() - 17), "Convoy Files: c\r\n");
  EXPECT_NE(text.find("\r\nLand Height(eaw16.hm): L\r\n"), std::string::npos);

  GameFolder game;
  Failures failures;
  SelectorState state;
  state.LibDir = game.Library();
  game.WithCategories("Mine: Q\r\n");
  PrepareLibrary(state, failures);
  EXPECT_EQ(game.Read("ZEP128/zep.ini"), "Mine: Q\r\n");
  EXPECT_EQ(state.List3, (Lines{"Show ALL", "Show Selections", "Mine"}));
}

TEST(CategoryFile, OddLinesAreSkippedAndNamed) {
  Lines lines = {"Maps: time: M", "no colon here", "Blank letter: ", "Unix line: U"};
  for (int i = 0; i < 260; ++i)
    lines.push_back("Extra: E");
  const Categories categories = ParseCategories(lines);
  ASSERT_EQ(categories.codes.size(), 255u);
  EXPECT_EQ(categories.descriptions[0], "Maps");
  EXPECT_EQ(categories.codes[0], "M");
  EXPECT_EQ(categories.codes[1], " ");
  ASSERT_EQ(categories.skipped.size(), 9u);
  EXPECT_EQ(categories.skipped[0].number, 2);
  EXPECT_EQ(categories.skipped[0].text, "no colon here");
  EXPECT_EQ(categories.skipped[1].number, 257);
  EXPECT_EQ(SkippedLinesMessage(categories.skipped)[1], "line 2: no colon here");
}
