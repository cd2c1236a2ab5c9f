#include "base/listing.h"
#include "base/names.h"
#include "base/text_file.h"
#include "library/grid_builder.h"
#include "library/grid_click.h"
#include "library/record_replay.h"
#include "slots/plane_set.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// A description file with the aircraft, the slot and whatever lines from 166 on.
std::string Description(const std::string &aircraft, const std::string &slot,
                        const Names &skinLines) {
  Names lines(165, "0");
  lines[0] = aircraft;
  lines[1] = slot;
  lines.insert(lines.end(), skinLines.begin(), skinLines.end());
  return JoinCrLf(lines);
}

} // namespace

using SlotGrid = GameTest;

TEST_F(SlotGrid, FlightModelFolderShowsItsPlaneSetsUntilUnloaded) {
  LibraryState state = LibraryFor(game.Path());
  const std::string pack = "ZEP128/F-Pack/";
  game.Write(pack + "P-Lightning/a.zep",
             Description("P-38 Lightning", "3 ", {"112", "51", "56", "104", "65"}));
  game.Write(pack + "P-Lightning/b.zep", Description("Other", "9", {}));
  game.MakeFolder(pack + "P-Empty");
  game.Write(pack + "p-lower/c.zep", "x");
  game.Write(pack + "Sounds/P-Inner/d.zep", "x");
  game.Write("ZEP128/F-Plain/planes.dat");
  BuildFolderRows(state.Unigrid, {"F"}, state.LibDir, ListFolderNames(state.LibDir));

  library::ClickRow(state, 0, caption, failures); // F-Pack
  EXPECT_TRUE(state.Slots.frameVisible);
  EXPECT_TRUE(state.Slots.gridVisible);
  EXPECT_EQ(state.Slots.label, "F-Pack: a.zep");
  ASSERT_EQ(state.Slots.rows.size(), 2u);
  EXPECT_EQ(state.Slots.rows[0].folder, "P-Empty");
  EXPECT_EQ(state.Slots.rows[0].aircraft + state.Slots.rows[0].skinSlot, "");
  EXPECT_EQ(state.Slots.rows[1].folder, "P-Lightning");
  EXPECT_EQ(state.Slots.rows[1].aircraft, "P-38 Lightning");
  EXPECT_EQ(state.Slots.rows[1].plnSlot, "3 ");
  EXPECT_EQ(state.Slots.rows[1].skinSlot, "P38H");

  library::ClickRow(state, 1, caption, failures); // F-Plain replaces F-Pack
  EXPECT_FALSE(state.Slots.frameVisible);
  EXPECT_FALSE(state.Unigrid.Row(0).loaded);

  library::ClickRow(state, 1, caption, failures); // unload F-Plain
  EXPECT_TRUE(state.Slots.rows.empty());
  EXPECT_FALSE(state.Slots.frameVisible);

  game.WithRecord("F-Plain\r\nF-Pack\r\n"); // at start-up, the last one recorded shows
  ReplayRecord(state, failures);
  EXPECT_TRUE(state.Slots.frameVisible);
  EXPECT_EQ(state.Slots.label, "F-Pack: a.zep");
  EXPECT_EQ(RowNames(state.Unigrid, true), (Names{"F-Pack [S]", "F-Plain [S]"}));
}

TEST_F(SlotGrid, SkinCodeTakesOnlyCharacterCodesThatExist) {
  game.Write("P-Short/a.zep", Description("Short", "1", {"112", "51"}));
  game.Write("P-Odd/a.zep",
             Description("Odd", "1", {"\t 112.9", "99999999999999999999999999", "-1", "x"}));
  EXPECT_EQ(ReadPlaneSet(game.Path() / "P-Short", failures).skinSlot, "P3");
  EXPECT_EQ(ReadPlaneSet(game.Path() / "P-Odd", failures).skinSlot, std::string("P\0", 2));
}
