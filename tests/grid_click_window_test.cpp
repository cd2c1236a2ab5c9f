#include "tests/game_folder.h"
#include "tests/window_driver.h"

#include <QTableWidget>
#include <QTest>
#include <gtest/gtest.h>

// Where each file goes and what the category rules keep are the logic tests' matter: this checks
// that a click reaches them and the grid shows what they did (Enter and input while a load runs:
// feedback_window_test.cpp).
TEST(GridClickWindow, AClickLoadsAGreenRowAClickOnItUnloadsItAFlightModelShowsItsPlaneSets) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Singles: Q\r\nFlight models: F\r\n");
  game.Addon("Q-Mix", {"a.MSN", "d.txt", "held.dat"});
  game.MakeFolder("held.dat/in-the-way"); // a copy that fails is told in a box
  std::string zep = "Lightning\r\n7 \r\n";
  for (int line = 3; line <= 165; ++line)
    zep += "0\r\n";
  zep += "112\r\n51\r\n56\r\n104\r\n";
  game.Write("ZEP128/F-Fast/P-Lightning/plane.zep", zep);
  game.Write("ZEP128/F-Plain/flight.dat");
  WindowDriver driver(game.Path());

  driver.ClickRow(1, 2);
  EXPECT_EQ(driver.Cell(1).data(Qt::BackgroundRole).value<QColor>(), QColor(192, 255, 192));
  EXPECT_EQ(driver.Mark(1), "S");
  EXPECT_EQ(driver.Summary(), "Loaded \"Q-Mix\": 2 files copied.");
  EXPECT_TRUE(driver.OneMessage({"held.dat"}));

  driver.ClickRow(1);
  EXPECT_EQ(driver.Mark(1), "");
  EXPECT_EQ(driver.Summary(), "Unloaded \"Q-Mix\": 2 files deleted.");
  EXPECT_TRUE(driver.TakeMessages().isEmpty());

  auto *panel = driver.Find<QWidget>("SlotFrame");
  auto *slotGrid = driver.Find<QTableWidget>("SlotGrid");
  driver.ClickRow(2);
  EXPECT_TRUE(panel->isVisible());
  ASSERT_EQ(slotGrid->rowCount(), 1);
  EXPECT_EQ(slotGrid->item(0, 3)->toolTip(), "Lightning");
  EXPECT_EQ(driver.Find<QLabel>("SlotLabel")->text(), "F-Fast: plane.zep");
  // The panel covers the description box: it gives way while the pointer is over a row.
  driver.HoverRow(3);
  EXPECT_FALSE(panel->isVisible());
  QTest::mouseMove(driver.Find<QWidget>("LoadFrame"), QPoint(150, 4));
  EXPECT_TRUE(panel->isVisible());
  driver.ClickRow(3);
  EXPECT_FALSE(panel->isVisible());
}
