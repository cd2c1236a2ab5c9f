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
  Gather(selector.StartUp());
  const auto shown = [&](int entry) {
    selector.ShowCategory(entry);
    std::vector<std::string> names;
    for (int row = 1; row < selector.State().Unigrid.RowCount(); ++row)
      if (selector.State().Unigrid.Row(row).height > 0)
        names.push_back(selector.State().Unigrid.Row(row).name);
    return names;
  };
  EXPECT_EQ(selector.State().Codes, (std::vector<std::string>{"\xC3\x84", "#", "\xC3\x96"}));
#ifndef _WIN32
  EXPECT_EQ(shown(2), (std::vector<std::string>{"\xC3\x84-utf8", "\xC4-latin"}));
  EXPECT_EQ(shown(0).size(), 4u);
#endif
  EXPECT_EQ(shown(3), std::vector<std::string>{"#-mine"});
  EXPECT_EQ(shown(4), std::vector<std::string>{"\xC3\x96-other"});
}
