#include "library/refresh.h"

#include "app/category_file.h"
#include "library/category_view.h"
#include "library/listing.h"
#include "tests/recording_caption.h"
#include "tests/test_folder.h"

#include <gtest/gtest.h>

namespace fs = std::filesystem;

using Names = std::vector<std::string>;

static Names RowNames(const FolderGrid &grid) {
  Names names;
  for (size_t row = 1; row < grid.rows.size(); ++row)
    names.push_back(grid.rows[row].name + (grid.rows[row].mark == "S" ? " [S]" : ""));
  return names;
}

TEST(Refresh, RereadsTheLibraryAndKeepsLoadedRowsWithoutTouchingFiles) {
  TestFolder game;
  game.Write("planes.dat", "planes");
  for (const char *name : {"F-Spit", "S-Camo", "G-Sky", "unused"})
    game.Write(std::string("ZEP128/") + name + "/planes.dat", "addon");
  AppState state = StateFor(game.Path());
  state.Codes = {"S"};
  RecordingCaption caption;
  Failures failures;
  Label33Click(state, caption, failures);
  EXPECT_EQ(game.Read("ZEP128/zep.ini"), DefaultCategoryText());
  EXPECT_TRUE(game.Exists("ZEP128/FoldersLoaded.txt"));
  EXPECT_EQ(RowNames(state.Unigrid), (Names{"F-Spit", "S-Camo", "G-Sky"}));

  game.Write("ZEP128/FoldersLoaded.txt", "S-Camo\r\nG-Sky\r\n\r\n");
  fs::remove_all(game.Path() / "ZEP128/F-Spit");
  game.MakeFolder("ZEP128/F-Hurri");
  game.MakeFolder("ZEP128/S-Desert");
  List3Click(state, 2);
  state.HoverRow = 2;
  Label33Click(state, caption, failures);

  EXPECT_EQ(RowNames(state.Unigrid), (Names{"F-Hurri", "S-Camo [S]", "S-Desert", "G-Sky [S]"}));
  EXPECT_EQ(state.Unigrid.rows[2].nameColour, kLoadedColour);
  for (const GridRow &row : state.Unigrid.rows)
    EXPECT_EQ(row.height, kRowHeight);
  EXPECT_EQ(state.Codes, (Names{"S"}));
  EXPECT_EQ(state.HoverRow, -1);
  EXPECT_TRUE(state.Ready);
  EXPECT_EQ(ListFiles(game.Path()), (Names{"planes.dat"}));
  EXPECT_EQ(game.Read("planes.dat"), "planes");
  EXPECT_EQ(game.Read("ZEP128/FoldersLoaded.txt"), "S-Camo\r\nG-Sky\r\n\r\n");
  EXPECT_TRUE(failures.Empty());
}
