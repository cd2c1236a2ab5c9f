#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// A Selector on a game folder whose library the test fills before StartUp.
class GridClick : public SelectorTest {
protected:
  const SelectorState &State() const { return selector->State(); }
  const GridRow &Row(const std::string &name) const {
    return State().Unigrid.Row(RowOf(State().Unigrid, name));
  }
};

} // namespace

TEST_F(GridClick, GreenRowUnloadsEnterClicksOtherKeysAndRowsOutsideDoNothing) {
  game.Addon("S-One", {"one.dat"});
  game.WithCategories("Campaigns: C\r\nSounds: N\r\nSkins: S\r\n");
  Gather(selector->ClickRow(0)); // empty grid
  Gather(selector->StartUp());
  EXPECT_EQ(Gather(selector->ClickRow(-1)).summary, ""); // above the first row: clears the line
  const int row = RowOf(State().Unigrid, "S-One");
  EXPECT_FALSE(Gather(selector->PressKey(row, 'a')).summary); // other keys leave the line
  EXPECT_FALSE(game.Exists("one.dat"));
  Gather(selector->PressKey(row, kEnterKey));
  EXPECT_TRUE(game.Exists("one.dat"));
  EXPECT_EQ(State().Unigrid.currentCol, 1); // coloured in its name column
  Click("S-One");
  EXPECT_FALSE(game.Exists("one.dat"));
  EXPECT_FALSE(Row("S-One").loaded);
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

  for (const char *kept :
       {"one.dat", "two.dat", "Savedata/a.msn", "Savedata/b.msn", "Savedata/war.sve"})
    EXPECT_TRUE(game.Exists(kept)) << kept;
  EXPECT_FALSE(game.Exists("ZEP128/C-A/war.sve"));
  EXPECT_EQ(game.Record(), record);
  // Each recorded folder has copies in the game, so each shows loaded, two of a letter too.
  for (const char *loaded : {"C-A", "C-B", "S-One", "S-Two"})
    EXPECT_TRUE(Row(loaded).loaded) << loaded;
}
