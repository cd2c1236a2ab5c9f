#include "tests/game_folder.h"
#include "tests/window_driver.h"

#include <QApplication>
#include <QImage>
#include <QTest>
#include <gtest/gtest.h>

namespace {

QStringList ShownFolders(WindowDriver &driver) {
  QStringList names;
  QTableView *grid = driver.Grid();
  for (int row = 0; row < grid->model()->rowCount(); ++row)
    if (!grid->isRowHidden(row))
      names << grid->model()->index(row, 1).data().toString();
  return names;
}

QString Header(WindowDriver &driver) {
  return driver.Grid()->model()->headerData(1, Qt::Horizontal).toString();
}

} // namespace

TEST(ViewsWindow, CategoriesRefreshTypingAndResetAllShowInTheGrid) {
  GameFolder game;
  game.WithCategories("Skins: S\r\nLower: s\r\nSounds: N\r\n");
  for (const char *name : {"S-a", "S b", "Sx", "s-c", "N-d"})
    game.MakeFolder(std::string("ZEP128/") + name);
  for (const char *name : {"readme.txt", "pic1.bmp", "title.bmp"})
    game.Write(name);
  WindowDriver driver(game.Path());
  EXPECT_EQ(Header(driver), "All folders are available");

  driver.ClickEntry("List3", 2);
  EXPECT_EQ(driver.Find<QLabel>("Label6")->text(), "S");
  EXPECT_EQ(ShownFolders(driver), (QStringList{"S b", "S-a"}));
  EXPECT_EQ(Header(driver), "Only one selection can be made!");
  driver.ClickEntry("List3", 3);
  EXPECT_EQ(ShownFolders(driver), QStringList{"s-c"});
  driver.ClickEntry("List3", 4);
  EXPECT_EQ(Header(driver), "Multiple selections are allowed!");
  driver.ClickEntry("List3", 1);
  EXPECT_TRUE(ShownFolders(driver).isEmpty());
  EXPECT_EQ(Header(driver), "All folders are available");
  driver.ClickEntry("List3", 0);
  EXPECT_EQ(ShownFolders(driver).size(), 5);

  driver.ClickEntry("List3", 2);
  game.Write("ZEP128/S-gamma/planes.dat");
  driver.Click("Label33");
  // A refresh shows the library as it is now, and keeps the category shown (grid_views_test.cpp).
  EXPECT_EQ(driver.Find<QLabel>("Label6")->text(), "S");
  EXPECT_EQ(driver.Summary(), "Refresh: 6 folders, 1 new, 0 gone");
  EXPECT_EQ(ShownFolders(driver), (QStringList{"S b", "S-a", "S-gamma"}));

  QTableView *grid = driver.Grid();
  grid->setFocus();
  QTest::keyClicks(grid, "S-g");
  EXPECT_EQ(grid->currentIndex().data().toString(), "S-gamma");
  QTest::qWait(QApplication::keyboardInputInterval() + 50);
  // A first letter typed anew goes on to the next shown row, past hidden ones and round to the top.
  QTest::keyClicks(grid, "s");
  EXPECT_EQ(grid->currentIndex().data().toString(), "S b");

  driver.ClickRow(3);
  EXPECT_TRUE(driver.Cell(3).data(Qt::FontRole).value<QFont>().bold());
  EXPECT_FALSE(driver.Cell(2).data(Qt::FontRole).isValid());
  EXPECT_EQ(driver.Cell(3).data(Qt::ToolTipRole).toString(), "S-gamma");

  EXPECT_EQ(driver.AnswerNextBox(QMessageBox::NoButton, [&] { driver.Click("Command1"); }),
            "Reset All will unload every loaded folder: it takes out the 1 file they put into the "
            "game and puts back the game's own files they replaced. The loaded folders are saved "
            "first as the setup \"Before Reset All\": switching to it (right-click the folder "
            "grid) loads them again. It also deletes these 2 files from the game folder:\n"
            "pic1.bmp\nreadme.txt");
  EXPECT_EQ(driver.Mark(3), "S");
  driver.AnswerNextBox(QMessageBox::Ok, [&] { driver.Click("Command1"); });
  EXPECT_FALSE(game.Exists("pic1.bmp"));
  EXPECT_EQ(driver.Mark(3), "");
}

TEST(ViewsWindow, HoverShowsThePreviewOfTheRowEnteredAndLeavingClearsIt) {
  GameFolder game;
  game.WithCategories("Skins: S\r\n");
  game.Write("ZEP128/S-a/contents.TXT", "Line one\r\nLine two\nLine three");
  QImage picture(40, 30, QImage::Format_RGB32);
  picture.fill(Qt::red);
  picture.save(QString::fromStdString((game.MakeFolder("ZEP128/S-a") / "mypic").string()), "JPG");
  game.Write("ZEP128/S-b/a.jpg", "not a picture");
  game.Write("ZEP128/S-c/contents.txt", std::string((1 << 20) + 1, 'x'));
  WindowDriver driver(game.Path());
  auto *text = driver.Find<QPlainTextEdit>("Text9");
  auto *image = driver.Find<QLabel>("MyImage");

  driver.HoverRow(1);
  EXPECT_EQ(driver.Find<QLabel>("MyLabel")->text(), "Line one\r\nLine two\r\nLine three\r\n");
  EXPECT_EQ(text->toPlainText(), "Line one\nLine two\nLine three\n");
  EXPECT_FALSE(image->pixmap().isNull());

  driver.HoverRow(2);
  EXPECT_EQ(text->toPlainText(), "");
  EXPECT_TRUE(image->pixmap().isNull());
  driver.HoverRow(3);
  EXPECT_TRUE(text->toPlainText().startsWith("This description is too large to show: 1024 KB"));
  // Leaving the rows clears the preview, and the same row entered again shows it again.
  QTest::mouseMove(driver.Find<QWidget>("LoadFrame"), QPoint(200, 3));
  EXPECT_EQ(text->toPlainText(), "");
  driver.HoverRow(3);
  EXPECT_FALSE(text->toPlainText().isEmpty());
  EXPECT_TRUE(driver.TakeMessages().isEmpty());
  // The pointer stays where a test leaves it, and a move to the same place is no move.
  QTest::mouseMove(driver.Find<QWidget>("LoadFrame"), QPoint(200, 3));
}
