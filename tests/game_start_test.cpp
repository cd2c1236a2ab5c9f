#include "base/names.h"
#include "tests/selector_fixture.h"

using GameStart = SelectorTest;

TEST_F(GameStart, WindowsProgramsAreToldApartAndAMissingGameIsNamed) {
  Gather(selector->StartGame());
  ASSERT_EQ(failures.Lines().size(), 1u);
  EXPECT_NE(failures.Lines()[0].find("eaw.exe was not found"), std::string::npos);
  EXPECT_TRUE(starter.started.empty());

  game.Write("EAW.EXE", "MZ\x90");
  Gather(selector->StartGame());
  game.Write("EAW.EXE", "#!/bin/sh\n");
  Gather(selector->StartGame());
  game.Write("EAW.EXE", "M");
  Gather(selector->StartGame());
  EXPECT_EQ(starter.windows, (std::vector<bool>{true, false, false}));
  ASSERT_EQ(starter.started.size(), 3u);
  EXPECT_EQ(starter.started[0].parent_path(), game.Path());
  EXPECT_EQ(Upper(NameText(starter.started[0])), "EAW.EXE");
  EXPECT_EQ(failures.Lines().size(), 1u);
}
