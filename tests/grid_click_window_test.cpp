#include "tests/game_folder.h"
#include "tests/window_driver.h"
#include "ui/input_blocker.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMessageBox>
#include <QTableWidget>
#include <QTest>
#include <gtest/gtest.h>

namespace {

QColor NameCellColour(WindowDriver &driver, int row) {
  return driver.Grid()->model()->index(row - 1, 1).data(Qt::BackgroundRole).value<QColor>();
}

QString Mark(WindowDriver &driver, int row) {
  return driver.Grid()->model()->index(row - 1, 2).data().toString();
}

const QColor kGreen(192, 255, 192);

} // namespace

TEST(GridClickWindow, LoadCopiesEachFileToItsPlaceAndUnloadDeletesTheCopies) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Singles: Q\r\n");
  game.Addon("Q-Mix", {"a.MSN", "b.sve", "c.BGM", "d.txt", "mypic", "contents.txt"});
  SetReadOnly(game.Path() / "ZEP128/Q-Mix/d.txt", true);
  WindowDriver driver(game.Path());
  const QString caption = driver.Window().windowTitle();

  driver.ClickRow(1, 2);
  EXPECT_EQ(game.Read("Savedata/a.MSN"), "a.MSN");
  EXPECT_TRUE(game.Exists("Savedata/b.sve"));
  EXPECT_TRUE(game.Exists("Music/c.BGM"));
  EXPECT_TRUE(game.Exists("d.txt"));
  for (const char *kept : {"mypic", "contents.txt"})
    EXPECT_FALSE(game.Exists(kept)) << kept;
  EXPECT_TRUE(IsWritable(game.Path() / "d.txt"));
  EXPECT_TRUE(IsWritable(game.Path() / "ZEP128/Q-Mix/d.txt"));
  EXPECT_EQ(NameCellColour(driver, 1), kGreen);
  EXPECT_EQ(Mark(driver, 1), "S");
  EXPECT_EQ(game.Record(), "Q-Mix\r\n\r\n");
  EXPECT_EQ(driver.Window().windowTitle(), caption);
  EXPECT_EQ(driver.Find<QLabel>("Label22")->text(), "Loaded \"Q-Mix\": 4 files copied.");

  driver.ClickRow(1);
  for (const char *copy : {"Savedata/a.MSN", "Music/c.BGM", "d.txt"})
    EXPECT_FALSE(game.Exists(copy)) << copy;
  EXPECT_TRUE(game.Exists("Savedata/b.sve"));
  EXPECT_EQ(Mark(driver, 1), "");
  EXPECT_EQ(game.Record(), "\r\n");
  EXPECT_EQ(driver.Find<QLabel>("Label22")->text(), "Unloaded \"Q-Mix\": 3 files deleted.");
  EXPECT_TRUE(driver.TakeMessages().isEmpty());
}

TEST(GridClickWindow, SingleSelectionSwapsAndMultiSelectionKeepsBoth) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Skins: S\r\nSounds: N\r\n");
  game.Write("ZEP128/S-one/one.dat");
  game.Write("ZEP128/S-two/two.dat");
  game.Write("ZEP128/N-a/a.wav");
  game.Write("ZEP128/N-b/b.wav");
  WindowDriver driver(game.Path());

  driver.ClickRow(1);
  driver.ClickRow(2);
  EXPECT_FALSE(game.Exists("one.dat"));
  EXPECT_TRUE(game.Exists("two.dat"));
  EXPECT_EQ(Mark(driver, 1), "");
  EXPECT_EQ(Mark(driver, 2), "S");

  driver.ClickRow(3);
  driver.Grid()->setCurrentIndex(driver.Grid()->model()->index(3, 1));
  driver.PressGridKey(Qt::Key_Return);
  driver.PressGridKey(Qt::Key_A);
  EXPECT_TRUE(game.Exists("a.wav"));
  EXPECT_TRUE(game.Exists("b.wav"));
  EXPECT_EQ(game.Record(), "S-two\r\nN-a\r\nN-b\r\n\r\n");

  // A held Enter repeats, and clicks arrive while a load runs: neither may act again.
  QKeyEvent held(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier, "\r", true);
  QApplication::sendEvent(driver.Grid(), &held);
  {
    const InputBlocker loading;
    driver.ClickRow(4);
  }
  EXPECT_EQ(Mark(driver, 4), "S");
  EXPECT_TRUE(game.Exists("b.wav"));
}

TEST(GridClickWindow, FlightModelShowsItsPlaneSetsUntilUnloaded) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Flight models: F\r\n");
  std::string zep = "Lightning\r\n7 \r\n";
  for (int line = 3; line <= 165; ++line)
    zep += "0\r\n";
  zep += "112\r\n51\r\n56\r\n104\r\n";
  game.Write("ZEP128/F-Fast/P-Lightning/plane.zep", zep);
  game.Write("ZEP128/F-Fast/flight.dat");
  game.Write("ZEP128/F-Plain/flight.dat");
  WindowDriver driver(game.Path());
  auto *panel = driver.Find<QWidget>("SlotFrame");
  auto *slotGrid = driver.Find<QTableWidget>("SlotGrid");

  driver.ClickRow(1);
  EXPECT_TRUE(panel->isVisible());
  ASSERT_EQ(slotGrid->rowCount(), 1);
  EXPECT_EQ(slotGrid->horizontalHeaderItem(3)->text(), "Aircraft");
  EXPECT_EQ(slotGrid->item(0, 2)->text(), "P38H");
  EXPECT_EQ(slotGrid->item(0, 3)->text(), "Lightning");
  EXPECT_EQ(slotGrid->item(0, 3)->toolTip(), "Lightning");
  EXPECT_EQ(driver.Find<QLabel>("SlotLabel")->text(), "F-Fast: plane.zep");
  // The panel covers the description box: it gives way while the pointer is over a row.
  QTableView *grid = driver.Grid();
  QTest::mouseMove(grid->viewport(), grid->visualRect(grid->model()->index(1, 1)).center());
  EXPECT_FALSE(panel->isVisible());
  QTest::mouseMove(driver.Find<QWidget>("LoadFrame"), QPoint(150, 4));
  EXPECT_TRUE(panel->isVisible());
  driver.ClickRow(2);
  EXPECT_EQ(Mark(driver, 2), "S");
  EXPECT_FALSE(panel->isVisible());
}

TEST(GridClickWindow, CopiesThatFailAreSkippedAndToldInOneBox) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Singles: Q\r\n");
  game.Addon("Q-Big", {"a.dat"});
  for (int i = 10; i < 30; ++i) {
    const std::string name = "f" + std::to_string(i) + ".dat";
    game.Write("ZEP128/Q-Big/" + name);
    game.MakeFolder(name + "/in-the-way");
  }
  WindowDriver driver(game.Path());
  driver.ClickRow(1);
  QApplication::processEvents();
  EXPECT_EQ(game.Read("a.dat"), "a.dat");
  EXPECT_EQ(Mark(driver, 1), "S");
  EXPECT_EQ(game.Record(), "Q-Big\r\n\r\n");
  const QList<QMessageBox *> boxes = driver.Window().findChildren<QMessageBox *>();
  ASSERT_EQ(boxes.size(), 1);
  EXPECT_TRUE(boxes[0]->text().contains("f21.dat"));
  EXPECT_FALSE(boxes[0]->text().contains("f22.dat"));
  EXPECT_TRUE(boxes[0]->text().endsWith("... and 8 more."));
  EXPECT_TRUE(boxes[0]->detailedText().contains("f29.dat"));
}
