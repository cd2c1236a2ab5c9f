#include "app/category_file.h"
#include "base/listing.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

using GridClick = SelectorTest;
using CategoryView = SelectorTest;
using Refresh = SelectorTest;

TEST_F(GridClick, GreenRowUnloadsEnterClicksOtherKeysAndRowsOutsideDoNothing) {
  game.Addon("S-One", {"one.dat"});
  const std::string longest = std::string(246, 'n') + ".dat"; // the longest name Windows keeps
  game.Write("ZEP128/S-One/" + longest);
  game.WithCategories("Campaigns: C\r\nSounds: N\r\nSkins: S\r\n");
  Gather(selector->ClickRow(0)); // empty grid
  Gather(selector->StartUp());
  EXPECT_EQ(Gather(selector->ClickRow(-1)).summary, ""); // above the first row: clears the line
  const int row = RowOf(selector->State().Unigrid, "S-One");
  EXPECT_FALSE(Gather(selector->PressKey(row, 'a')).summary); // other keys leave the line
  EXPECT_FALSE(game.Exists("one.dat"));
  Gather(selector->PressKey(row, kEnterKey));
  EXPECT_TRUE(game.All({"one.dat", longest}));
  EXPECT_EQ(selector->State().Unigrid.currentCol, 1); // coloured in its name column
  Click("S-One");
  EXPECT_TRUE(game.None({"one.dat", longest}));
  EXPECT_EQ(Mark("S-One"), "");
  EXPECT_EQ(game.Record(), "\r\n");
}

TEST_F(GridClick, ReplayMarksRowsWithoutTouchingFiles) {
  for (const char *name :
       {"ZEP128/S-One/one.dat", "ZEP128/S-Two/two.dat", "ZEP128/C-A/a.msn", "ZEP128/C-B/b.msn",
        "one.dat", "two.dat", "Savedata/a.msn", "Savedata/b.msn", "Savedata/war.sve"})
    game.Write(name);
  const std::string record = "S-One\r\nS-Two\r\nC-A\r\nC-B\r\n\r\n";
  game.WithRecord(record);
  game.WithCategories("Campaigns: C\r\nSkins: S\r\nSkins again: S\r\n"); // S is listed twice
  Gather(selector->StartUp());
  EXPECT_TRUE(OneFailure(Taken(), "earlier version"));
  EXPECT_TRUE(
      game.All({"one.dat", "two.dat", "Savedata/a.msn", "Savedata/b.msn", "Savedata/war.sve"}));
  EXPECT_FALSE(game.Exists("ZEP128/C-A/war.sve"));
  EXPECT_EQ(game.Record(), record);
  // Each recorded folder has copies in the game, so each shows loaded, two of a letter too.
  EXPECT_EQ(Mark("C-A") + Mark("C-B") + Mark("S-One") + Mark("S-Two"), "SSSS");
}

// A letter is the line's last character, in UTF-8 or Windows-1252 text, and a folder belongs to
// it when its name's first character is the same, read the same way.
TEST_F(CategoryView, LettersBeyondAsciiListTheirFoldersAndNoLetterListsTheProgramsOwnFolder) {
  game.WithCategories("Eigene: \xC4\r\nMine: #\r\n\xD6sterreich: \xD6\r\n");
  for (const char *name : {"\xC3\x84-utf8", "\xC3\x96-other", "#-mine"})
    game.MakeFolder(std::string("ZEP128/") + name);
#ifndef _WIN32
  game.MakeFolder("ZEP128/\xC4-latin"); // a name in Windows-1252 bytes
#endif
  game.MakeFolder("ZEP128/#Selector");
  Gather(selector->StartUp());
  const auto shown = [&](int entry) {
    selector->ShowCategory(entry);
    Names names;
    for (const GridRow &row : selector->State().Unigrid.rows)
      if (row.shown)
        names.push_back(row.name);
    return names;
  };
  EXPECT_EQ(selector->State().Codes, (Names{"\xC3\x84", "#", "\xC3\x96"}));
#ifndef _WIN32
  EXPECT_EQ(shown(2), (Names{"\xC3\x84-utf8", "\xC4-latin"}));
  EXPECT_EQ(shown(0).size(), 4u);
#endif
  EXPECT_EQ(shown(3), Names{"#-mine"});
  EXPECT_EQ(shown(4), Names{"\xC3\x96-other"});
}

// Typing goes to the next shown row from the one given, round past the end, in any letter case.
TEST(FolderGrid, FindShownRowStartsAtTheRowGivenAndSkipsHiddenRows) {
  FolderGrid grid;
  EXPECT_EQ(grid.FindShownRow(0, "S"), -1);
  for (const char *name : {"S-alpha", "N-bravo", "s-beta"})
    grid.rows.push_back(GridRow{name});
  grid.Row(1).shown = false;
  EXPECT_EQ(grid.FindShownRow(0, "s"), 0);
  EXPECT_EQ(grid.FindShownRow(1, "S-"), 2);
  EXPECT_EQ(grid.FindShownRow(3, "s-a"), 0);
  EXPECT_EQ(grid.FindShownRow(-1, "S"), 2);
  EXPECT_EQ(grid.FindShownRow(0, "N"), -1);
}

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
}
