#include "library/grid_builder.h"
#include "library/grid_click.h"
#include "library/listing.h"
#include "library/loaded_record.h"
#include "library/record_replay.h"
#include "tests/recording_caption.h"
#include "tests/test_folder.h"

#include <gtest/gtest.h>

namespace fs = std::filesystem;

namespace {

class GridClick : public ::testing::Test {
protected:
  void SetUp() override { state.Ready = true; }

  // Lists the library's folders in the grid under the category letters `codes`.
  void Build(const std::vector<std::string> &codes = {"C", "N", "S"}) {
    BuildFolderRows(state.Unigrid, codes, ListFolders(state.LibDir));
  }
  int RowOf(const std::string &name, int after = 0) const {
    for (int row = after + 1; row < state.Unigrid.RowCount(); ++row)
      if (state.Unigrid.rows[static_cast<size_t>(row)].name == name)
        return row;
    return 0;
  }
  const GridRow &Row(const std::string &name) const {
    return state.Unigrid.rows[static_cast<size_t>(RowOf(name))];
  }
  void Click(const std::string &name) {
    state.Unigrid.currentRow = RowOf(name);
    UnigridClick(state, caption, failures);
  }
  std::string Record() const { return game.Read("ZEP128/FoldersLoaded.txt"); }

  TestFolder game;
  AppState state = StateFor(game.Path());
  RecordingCaption caption;
  Failures failures;
};

} // namespace

TEST_F(GridClick, GreenRowUnloadsEnterClicksOtherKeysAndHeaderDoNothing) {
  game.Write("ZEP128/S-One/one.dat");
  state.Unigrid.currentRow = 0;
  UnigridClick(state, caption, failures); // empty grid
  Build();
  UnigridClick(state, caption, failures); // header row
  state.Unigrid.currentRow = RowOf("S-One");
  state.Unigrid.currentCol = 2;
  UnigridKeyPress(state, 'a', caption, failures);
  EXPECT_FALSE(game.Exists("one.dat"));
  UnigridKeyPress(state, kEnterKey, caption, failures);
  EXPECT_TRUE(game.Exists("one.dat"));
  EXPECT_EQ(state.Unigrid.currentCol, 1); // coloured in its name column
  Click("S-One");
  EXPECT_FALSE(game.Exists("one.dat"));
  EXPECT_EQ(Row("S-One").mark, "");
  EXPECT_EQ(Record(), "\r\n");
}

TEST_F(GridClick, ReplayMarksRowsWithoutTouchingFiles) {
  for (const char *name :
       {"ZEP128/S-One/one.dat", "ZEP128/S-Two/two.dat", "ZEP128/C-A/a.msn", "ZEP128/C-B/b.msn",
        "one.dat", "two.dat", "Savedata/a.msn", "Savedata/b.msn", "Savedata/war.sve"})
    game.Write(name);
  const std::string record = "S-One\r\nS-Two\r\nC-A\r\nC-B\r\n\r\n";
  game.Write("ZEP128/FoldersLoaded.txt", record);
  Build({"C", "S", "S"}); // S is listed twice
  state.Ready = false;
  ReplayRecord(state, caption, failures);

  for (const char *kept :
       {"one.dat", "two.dat", "Savedata/a.msn", "Savedata/b.msn", "Savedata/war.sve"})
    EXPECT_TRUE(game.Exists(kept)) << kept;
  EXPECT_FALSE(game.Exists("ZEP128/C-A/war.sve"));
  EXPECT_EQ(Record(), record);
  EXPECT_EQ(Row("C-A").mark, "");
  EXPECT_EQ(Row("C-B").mark, "S");
  // Of the four S rows only the last replayed one stays marked.
  EXPECT_EQ(state.Unigrid.rows[static_cast<size_t>(RowOf("S-Two", RowOf("S-Two")))].mark, "S");
  EXPECT_EQ(Row("S-One").mark, "");
  EXPECT_EQ(Row("S-Two").mark, "");
}
