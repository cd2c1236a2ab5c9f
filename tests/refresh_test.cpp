#include "app/category_file.h"
#include "base/listing.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace fs = std::filesystem;

using Names = std::vector<std::string>;

using Refresh = SelectorTest;

TEST_F(Refresh, RereadsTheLibraryAndKeepsLoadedRowsWithoutTouchingFiles) {
  game.Write("planes.dat", "planes");
  for (const char *name : {"F-Spit", "S-Camo", "G-Sky", "unused"})
    game.Write(std::string("ZEP128/") + name + "/planes.dat", "addon");
  const SelectorState &state = selector->State();
  // The category list is read at start-up only: a refresh keeps its letters.
  game.WithCategories("Skins: S\r\n");
  Gather(selector->StartUp());
  fs::remove(game.Path() / "ZEP128/zep.ini");
  fs::remove(game.Path() / "ZEP128/FoldersLoaded.txt");
  Gather(selector->RefreshLibrary());
  EXPECT_EQ(game.Read("ZEP128/zep.ini"), DefaultCategoryText());
  EXPECT_TRUE(game.Exists("ZEP128/FoldersLoaded.txt"));
  EXPECT_EQ(RowNames(state.Unigrid, true), (Names{"F-Spit", "S-Camo", "G-Sky"}));

  game.WithRecord("S-Camo\r\nG-Sky\r\n\r\n");
  fs::remove_all(game.Path() / "ZEP128/F-Spit");
  game.MakeFolder("ZEP128/F-Hurri");
  game.MakeFolder("ZEP128/S-Desert");
  selector->ShowCategory(2);
  selector->HoverRow(1);
  const Outcome refreshed = Gather(selector->RefreshLibrary());

  EXPECT_EQ(RowNames(state.Unigrid, true),
            (Names{"F-Hurri", "S-Camo [S]", "S-Desert", "G-Sky [S]"}));
  // The category shown before is shown again, with its header.
  for (int row = 0; row < state.Unigrid.RowCount(); ++row)
    EXPECT_EQ(state.Unigrid.Row(row).shown, row == 1 || row == 2) << row;
  EXPECT_EQ(state.Unigrid.rule, "Only one selection can be made!");
  EXPECT_EQ(refreshed.summary, "Refresh: 4 folders, 2 new, 1 gone");
  EXPECT_EQ(state.Codes, (Names{"S"}));
  EXPECT_FALSE(state.hoveredRow);
  EXPECT_EQ(ListFiles(game.Path()), (Names{"planes.dat"}));
  EXPECT_EQ(game.Read("planes.dat"), "planes");
  EXPECT_EQ(game.Record(), "S-Camo\r\nG-Sky\r\n\r\n");
  EXPECT_TRUE(failures.Empty());
}
