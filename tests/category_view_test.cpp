#include "library/category_view.h"

#include "library/refresh.h"
#include "tests/recording_caption.h"
#include "tests/test_folder.h"

#include <gtest/gtest.h>

using Names = std::vector<std::string>;

static Names ShownNames(const FolderGrid &grid) {
  Names names;
  for (size_t row = 1; row < grid.rows.size(); ++row)
    if (grid.rows[row].height == kRowHeight)
      names.push_back(grid.rows[row].name);
  return names;
}

TEST(CategoryView, ShowsAllSelectionsOrTheFoldersOfOneLetter) {
  TestFolder game;
  game.Write("ZEP128/zep.ini", "Skins: S\r\nScenarios: s\r\n");
  for (const char *name : {"S-One", "S Two", "Sx Three", "s-four"})
    game.MakeFolder(std::string("ZEP128/") + name);
  AppState state = StateFor(game.Path());
  state.Codes = {"S", "s"};
  RecordingCaption caption;
  Failures failures;
  Label33Click(state, caption, failures);

  EXPECT_EQ(List3Click(state, 2), "S");
  EXPECT_EQ(ShownNames(state.Unigrid), (Names{"S Two", "S-One"}));
  EXPECT_EQ(List3Click(state, 3), "s");
  EXPECT_EQ(ShownNames(state.Unigrid), (Names{"s-four"}));
  EXPECT_EQ(List3Click(state, 1), "");
  EXPECT_TRUE(ShownNames(state.Unigrid).empty());
  EXPECT_EQ(List3Click(state, 0), "");
  EXPECT_EQ(ShownNames(state.Unigrid), (Names{"S Two", "S-One", "Sx Three", "s-four"}));
  EXPECT_EQ(state.Unigrid.rows[0].name, kAllFoldersText);

  state.Unigrid.rows[1].mark = "S";
  state.Unigrid.rows[3].mark = "S";
  List3Click(state, 1);
  EXPECT_EQ(ShownNames(state.Unigrid), (Names{"S Two", "Sx Three"}));
  EXPECT_EQ(state.Unigrid.currentRow, 3);
  EXPECT_EQ(state.Unigrid.rows[3].nameColour, kLoadedColour);
}

TEST(CategoryView, HeaderTellsWhetherSeveralMayBeLoaded) {
  AppState state;
  state.Codes = {"G", "N", "X", "Y", "Z", "K", "g", "S", "k"};
  for (int k = 2; k < 11; ++k) {
    List3Click(state, k);
    EXPECT_EQ(state.Unigrid.rows[0].name, k < 8 ? kMultipleSelectionText : kSingleSelectionText)
        << state.Codes[k - 2];
  }
  List3Click(state, 1);
  EXPECT_EQ(state.Unigrid.rows[0].name, kAllFoldersText);
}
