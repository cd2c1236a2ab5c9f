#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

using CategoryView = SelectorTest;

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
    std::vector<std::string> names;
    for (const GridRow &row : selector->State().Unigrid.rows)
      if (row.shown)
        names.push_back(row.name);
    return names;
  };
  EXPECT_EQ(selector->State().Codes, (std::vector<std::string>{"\xC3\x84", "#", "\xC3\x96"}));
#ifndef _WIN32
  EXPECT_EQ(shown(2), (std::vector<std::string>{"\xC3\x84-utf8", "\xC4-latin"}));
  EXPECT_EQ(shown(0).size(), 4u);
#endif
  EXPECT_EQ(shown(3), std::vector<std::string>{"#-mine"});
  EXPECT_EQ(shown(4), std::vector<std::string>{"\xC3\x96-other"});
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
