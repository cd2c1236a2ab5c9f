#include "library/category_view.h"

#include <gtest/gtest.h>

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
