#include "settings/game_start_qt.h"
#include "tests/test_folder.h"

#include <QStandardPaths>
#include <QTest>
#include <gtest/gtest.h>

namespace fs = std::filesystem;

static int MarkerCount(const fs::path &folder) {
  int count = 0;
  for (const auto &entry : fs::directory_iterator(folder))
    count += entry.path().filename().string().rfind("started-", 0) == 0;
  return count;
}

TEST(GameStart, StartsTheGameOnEveryClickAndReportsAMissingOne) {
  TestFolder game;
  const std::string missing = StartGame(game.Path());
  EXPECT_NE(missing.find((game.Path() / "eaw.exe").string()), std::string::npos);
  if (!QStandardPaths::findExecutable("wine").isEmpty())
    GTEST_SKIP() << "wine would run the stand-in game";
  const fs::path exe = game.Write("eaw.exe", "#!/bin/sh\ntouch \"$(dirname \"$0\")/started-$$\"\n");
  fs::permissions(exe, fs::perms::owner_exec, fs::perm_options::add);
  EXPECT_EQ(StartGame(game.Path()), "");
  EXPECT_EQ(StartGame(game.Path()), "");
  EXPECT_TRUE(QTest::qWaitFor([&] { return MarkerCount(game.Path()) == 2; }, 5000));
}
