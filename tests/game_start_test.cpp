#include "base/names.h"
#include "tests/selector_fixture.h"

using GameStart = SelectorTest;

TEST_F(GameStart, WindowsProgramsAreToldApartAndAMissingGameIsNamed) {
  Gather(selector->StartGame());
  EXPECT_TRUE(OneFailure(Taken(), "eaw.exe was not found"));
  EXPECT_TRUE(starter.started.empty());

  game.Write("EAW.EXE", "MZ\x90");
  Gather(selector->StartGame());
  game.Write("EAW.EXE", "#!/bin/sh\n");
  Gather(selector->StartGame());
  game.Write("EAW.EXE", "Mz");
  Gather(selector->StartGame());
  EXPECT_EQ(starter.windows, (std::vector<bool>{true, false, false}));
  ASSERT_EQ(starter.started.size(), 3u);
  EXPECT_EQ(starter.started[0].parent_path(), game.Path());
  EXPECT_EQ(Upper(NameText(starter.started[0])), "EAW.EXE");
}
