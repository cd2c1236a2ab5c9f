#include "library/category_view.h"

#include <gtest/gtest.h>

TEST(CategoryView, HeaderTellsWhetherSeveralMayBeLoaded) {
  FolderGrid grid;
  const std::vector<std::string> codes = {"G", "N", "X", "Y", "Z", "K", "g", "S", "k"};
  for (int k = 2; k < 11; ++k) {
    ShowCategory(grid, codes, k);
    EXPECT_EQ(grid.rows[0].name, k < 8 ? kMultipleSelectionText : kSingleSelectionText)
        << codes[k - 2];
  }
  ShowCategory(grid, codes, 1);
  EXPECT_EQ(grid.rows[0].name, kAllFoldersText);
}
