#include "app/category_file.h"
#include "app/startup.h"
#include "base/listing.h"
#include "library/loaded_record.h"
#include "library/record_replay.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// The state after the library is prepared and the grid built, before the record is replayed.
SelectorState PreparedState(const GameFolder &game, Failures &failures) {
  SelectorState state;
  static_cast<LibraryState &>(state) = LibraryFor(game.Path());
  PrepareLibrary(state, failures);
  BuildGrid(state, state.Codes);
  return state;
}

} // namespace

using LibraryModel = GameTest;
using CategoryFile = GameTest;

TEST_F(LibraryModel, GridFollowsCategoryLinesThenNames) {
  game.WithCategories("Skins: S\nCampaigns: C\nMore skins: S\nLower: s\n");
  for (const char *name : {"S-b", "S a", "Sunset", "s-low", "C-camp", "Q-none", "unused",
                           "AutoScripts", "SKINFOLDER", "SkinFolder2"})
    game.MakeFolder(std::string("ZEP128/") + name);
  const SelectorState state = PreparedState(game, failures);
  EXPECT_EQ(RowNames(state.Unigrid), (Names{"S a", "S-b", "SkinFolder2", "Sunset", "C-camp", "S a",
                                            "S-b", "SkinFolder2", "Sunset", "s-low"}));
  EXPECT_EQ(state.Unigrid.PathOf(4), game.Path() / "ZEP128" / "C-camp");
  EXPECT_FALSE(state.Unigrid.Row(4).loaded);
}

TEST_F(LibraryModel, RecordHoldsLoadedNamesInRowOrderAndIsReplayed) {
  // The library's own files are found whatever their letter case, and never made twice.
  game.Write("zep128/ZEP.INI", "Skins: S\nAgain: S\nSounds: N\n");
  for (const char *name : {"S-one", "N-a", "N-b", "N-c"})
    game.MakeFolder(std::string("zep128/") + name);
  SelectorState state = PreparedState(game, failures);
  game.Write("zep128/foldersloaded.TXT", "N-c\n\nS-one\r\nGone\r\n\r\n");
  EnsureRecord(state, failures);
  ReplayRecord(state, failures);
  EXPECT_EQ(RowNames(state.Unigrid, true),
            (Names{"S-one [S]", "S-one [S]", "N-a", "N-b", "N-c [S]"}));
  EXPECT_EQ(state.Unigrid.currentRow, 1); // the last recorded row
  // The replay leaves the record as it was; the record names a folder of two rows once.
  EXPECT_EQ(game.Read("zep128/foldersloaded.TXT"), "N-c\n\nS-one\r\nGone\r\n\r\n");
  SaveLoaded(state, failures);
  EXPECT_EQ(game.Read("zep128/foldersloaded.TXT"), "S-one\r\nN-c\r\n\r\n");
  for (GridRow &row : state.Unigrid.rows)
    row.loaded = false;
  SaveLoaded(state, failures);
  EXPECT_EQ(game.Read("zep128/foldersloaded.TXT"), "\r\n");
  EXPECT_EQ(ListFiles(game.Path() / "zep128"), (Names{"foldersloaded.TXT", "ZEP.INI"}));
  EXPECT_EQ(ListFolders(game.Path()).size(), 1u);
}

TEST_F(LibraryModel, UnreadableLibraryFilesAreReportedNotFatal) {
  game.MakeFolder("ZEP128/zep.ini/in-the-way");
  game.MakeFolder("ZEP128/S-one");
  SelectorState state = PreparedState(game, failures);
  // The built-in categories stand in for the file that cannot be read.
  EXPECT_EQ(state.List3.size(), 29u);
  EXPECT_EQ(state.Unigrid.RowCount(), 1);
  EXPECT_TRUE(Contains(Taken().Message(""), "zep.ini"));
}

TEST_F(CategoryFile, ThePlayersFileIsKeptAndListsItsCategories) {
  SelectorState state;
  state.LibDir = game.Library();
  game.WithCategories("Mine: Q\r\n");
  PrepareLibrary(state, failures);
  EXPECT_EQ(game.Read("ZEP128/zep.ini"), "Mine: Q\r\n");
  EXPECT_EQ(state.List3, (Names{"Show ALL", "Show Selections", "Mine"}));
}

TEST(CategoryLines, OddLinesAreSkippedAndNamed) {
  Names lines = {"Maps: time: M", "no colon here", "Blank letter: ", "Unix line: U"};
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
