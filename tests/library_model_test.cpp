#include "app/category_file.h"
#include "app/startup.h"
#include "app/text_file.h"
#include "library/listing.h"
#include "library/loaded_record.h"
#include "library/record_replay.h"
#include "tests/recording_caption.h"
#include "tests/test_folder.h"

#include <gtest/gtest.h>

namespace fs = std::filesystem;
using Lines = std::vector<std::string>;

namespace {

Lines GridNames(const AppState &state) {
  Lines names;
  for (int row = 1; row < state.Unigrid.RowCount(); ++row)
    names.push_back(state.Unigrid.rows[static_cast<size_t>(row)].name);
  return names;
}

AppState PreparedState(const TestFolder &game, Failures &failures) {
  AppState state = StateFor(game.Path());
  PrepareLibrary(state, failures);
  BuildGrid(state, failures);
  return state;
}

} // namespace

TEST(CategoryFile, DefaultFileIsWrittenOnceByteForByte) {
  const std::string text = DefaultCategoryText();
  EXPECT_EQ(SplitLines(text).size(), 27u);
  EXPECT_EQ(text.substr(0, 28), "Versions of the EAW.exe: E\r\n");
  EXPECT_EQ(text.substr(text.size() - 17), "Convoy Files: c\r\n");
  EXPECT_NE(text.find("\r\nLand Height(eaw16.hm): L\r\n"), std::string::npos);

  TestFolder game;
  Failures failures;
  AppState state = StateFor(game.Path());
  game.Write("ZEP128/zep.ini", "Mine: Q\r\n");
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
  EXPECT_NE(SkippedLinesMessage(categories.skipped).find("line 2: no colon here"),
            std::string::npos);
}

TEST(LibraryModel, GridFollowsCategoryLinesThenNames) {
  TestFolder game;
  game.Write("ZEP128/zep.ini", "Skins: S\nCampaigns: C\nMore skins: S\nLower: s\n");
  for (const char *name : {"S-b", "S a", "Sunset", "s-low", "C-camp", "Q-none", "unused",
                           "AutoScripts", "SKINFOLDER", "SkinFolder2"})
    game.MakeFolder(std::string("ZEP128/") + name);
  Failures failures;
  const AppState state = PreparedState(game, failures);
  EXPECT_EQ(GridNames(state), (Lines{"S a", "S-b", "SkinFolder2", "Sunset", "C-camp", "S a", "S-b",
                                     "SkinFolder2", "Sunset", "s-low"}));
  EXPECT_EQ(state.Unigrid.rows[5].path, game.Path() / "ZEP128" / "C-camp");
  EXPECT_EQ(state.Unigrid.rows[5].mark, "");
}

TEST(LibraryModel, RecordHoldsLoadedNamesInRowOrderAndIsReplayed) {
  TestFolder game;
  game.Write("ZEP128/zep.ini", "Skins: S\nAgain: S\nSounds: N\n");
  for (const char *name : {"S-one", "N-a", "N-b", "N-c"})
    game.MakeFolder(std::string("ZEP128/") + name);
  Failures failures;
  AppState state = PreparedState(game, failures);
  game.Write("ZEP128/FoldersLoaded.txt", "N-c\n\nS-one\r\nGone\r\n\r\n");
  RecordingCaption caption;
  ReplayRecord(state, caption, failures);
  EXPECT_EQ(GridNames(state), (Lines{"S-one", "S-one", "N-a", "N-b", "N-c"}));
  // "S" allows one loaded folder: of the two S-one rows the later one stays loaded.
  for (int row : {2, 5}) {
    EXPECT_EQ(state.Unigrid.rows[static_cast<size_t>(row)].mark, "S") << row;
    EXPECT_EQ(state.Unigrid.rows[static_cast<size_t>(row)].nameColour, kLoadedColour) << row;
  }
  for (int row : {1, 3, 4})
    EXPECT_EQ(state.Unigrid.rows[static_cast<size_t>(row)].mark, "") << row;

  state.Ready = false;
  SaveLoaded(state, failures);
  EXPECT_EQ(game.Read("ZEP128/FoldersLoaded.txt"), "N-c\n\nS-one\r\nGone\r\n\r\n");
  state.Ready = true;
  SaveLoaded(state, failures);
  EXPECT_TRUE(state.Ready);
  EXPECT_EQ(game.Read("ZEP128/FoldersLoaded.txt"), "S-one\r\nN-c\r\n\r\n");
  for (GridRow &row : state.Unigrid.rows)
    row.mark.clear();
  SaveLoaded(state, failures);
  EXPECT_EQ(game.Read("ZEP128/FoldersLoaded.txt"), "\r\n");
  EXPECT_TRUE(failures.Empty());
}

TEST(LibraryModel, UnreadableLibraryFilesAreReportedNotFatal) {
  TestFolder game;
  game.MakeFolder("ZEP128/zep.ini/in-the-way");
  game.MakeFolder("ZEP128/S-one");
  Failures failures;
  AppState state = PreparedState(game, failures);
  // The built-in categories stand in for the file that cannot be read.
  EXPECT_EQ(state.List3.size(), 29u);
  EXPECT_EQ(state.Unigrid.RowCount(), 2);
  ASSERT_FALSE(failures.Empty());
  EXPECT_NE(failures.Message("").find("zep.ini"), std::string::npos);
}

TEST(LibraryModel, GridHeightStopsAtTwentyRows) {
  EXPECT_EQ(GridHeightTwips(1), 240 + 72);
  EXPECT_EQ(GridHeightTwips(19), 19 * 240 + 72);
  EXPECT_EQ(GridHeightTwips(5000), 20 * 240 + 72);
}

TEST(LibraryModel, LibraryFilesAreFoundWhateverTheirCase) {
  TestFolder game;
  game.Write("zep128/ZEP.INI", "Skins: S\r\n");
  game.Write("zep128/foldersloaded.TXT", "S-a\r\n");
  game.MakeFolder("zep128/S-a");
  Failures failures;
  AppState state = PreparedState(game, failures);
  EnsureRecord(state, failures);
  RecordingCaption caption;
  ReplayRecord(state, caption, failures);
  EXPECT_EQ(state.List3.size(), 3u);
  EXPECT_EQ(state.Unigrid.rows[1].mark, "S");
  EXPECT_EQ(ListFiles(game.Path() / "zep128"), (Lines{"foldersloaded.TXT", "ZEP.INI"}));
  EXPECT_EQ(ListFolders(game.Path()).size(), 1u);
}
