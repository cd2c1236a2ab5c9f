#include "tests/game_folder.h"
#include "tests/window_driver.h"

#include <QApplication>
#include <QImage>
#include <QTest>
#include <QTimer>
#include <gtest/gtest.h>

namespace fs = std::filesystem;

namespace {

void ChooseCategory(WindowDriver &driver, int entry) {
  auto *list = driver.Find<QListWidget>("List3");
  QTest::mouseClick(list->viewport(), Qt::LeftButton, {},
                    list->visualItemRect(list->item(entry)).center());
}

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

void HoverRow(WindowDriver &driver, int row) {
  QTableView *grid = driver.Grid();
  const QModelIndex index = grid->model()->index(row - 1, 1);
  QTest::mouseMove(grid->viewport(), grid->visualRect(index).center());
}

} // namespace

TEST(ViewsWindow, CategoriesShowTheirFoldersAndRule) {
  GameFolder game;
  game.WithCategories("Skins: S\r\nLower: s\r\nSounds: N\r\n");
  for (const char *name : {"S-a", "S b", "Sx", "s-c", "N-d"})
    game.MakeFolder(std::string("ZEP128/") + name);
  WindowDriver driver(game.Path());
  EXPECT_EQ(Header(driver), "All folders are available");

  ChooseCategory(driver, 2);
  EXPECT_EQ(driver.Find<QLabel>("Label6")->text(), "S");
  EXPECT_EQ(ShownFolders(driver), (QStringList{"S b", "S-a"}));
  EXPECT_EQ(Header(driver), "Only one selection can be made!");
  ChooseCategory(driver, 3);
  EXPECT_EQ(ShownFolders(driver), QStringList{"s-c"});
  ChooseCategory(driver, 4);
  EXPECT_EQ(Header(driver), "Multiple selections are allowed!");
  ChooseCategory(driver, 1);
  EXPECT_TRUE(ShownFolders(driver).isEmpty());
  EXPECT_EQ(Header(driver), "All folders are available");
  ChooseCategory(driver, 0);
  EXPECT_EQ(ShownFolders(driver).size(), 5);
}

TEST(ViewsWindow, RefreshRereadsTheLibraryAndKeepsLoadedRowsGreen) {
  GameFolder game;
  game.WithCategories("Skins: S\r\n");
  game.Write("ZEP128/S-keep/keep.dat", "library");
  game.Write("ZEP128/S-old/old.dat");
  WindowDriver driver(game.Path());
  driver.ClickRow(1);
  game.Write("keep.dat", "changed in the game");
  fs::remove_all(game.Path() / "ZEP128/S-old");
  game.MakeFolder("ZEP128/S-new");
  QTest::mouseClick(driver.Find<QLabel>("Label33"), Qt::LeftButton);
  EXPECT_EQ(ShownFolders(driver), (QStringList{"S-keep", "S-new"}));
  EXPECT_EQ(driver.Grid()->model()->index(0, 2).data().toString(), "S");
  EXPECT_EQ(game.Read("keep.dat"), "changed in the game");
  EXPECT_EQ(game.Record(), "S-keep\r\n\r\n");
}

TEST(ViewsWindow, ResetAllAsksThenDeletesAddOnFilesAndUnmarksEveryRow) {
  GameFolder game;
  game.WithCategories("Skins: S\r\n");
  game.Write("ZEP128/S-one/planes.dat");
  for (const char *name :
       {"hof.dat", "readme.txt", "chatline.txt", "pic1.bmp", "title.bmp", "dsg.ico", "eaw.exe"})
    game.Write(name);
  WindowDriver driver(game.Path());
  driver.ClickRow(1);
  ASSERT_TRUE(game.Exists("planes.dat"));
  auto *resetAll = driver.Find<QPushButton>("Command1");
  // Enter answers with the default button, Cancel: nothing is deleted.
  QString question;
  QTimer::singleShot(0, [&] {
    if (auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget())) {
      question = box->text();
      QTest::keyClick(box, Qt::Key_Return);
    }
  });
  QTest::mouseClick(resetAll, Qt::LeftButton);
  EXPECT_EQ(question, "Reset All will unload every loaded folder: it takes out the 1 file they "
                      "put into the game and puts back the game's own files they replaced. The "
                      "loaded folders are saved first as the setup \"Before Reset All\": "
                      "switching to it (right-click the folder grid) loads them again. It also "
                      "deletes these 2 files from the game folder:\npic1.bmp\nreadme.txt");
  EXPECT_TRUE(game.Exists("readme.txt"));
  EXPECT_EQ(driver.Grid()->model()->index(0, 2).data().toString(), "S");
  driver.AnswerNextBox(QMessageBox::Ok, [&] { QTest::mouseClick(resetAll, Qt::LeftButton); });
  for (const char *gone : {"planes.dat", "readme.txt", "pic1.bmp"})
    EXPECT_FALSE(game.Exists(gone)) << gone;
  for (const char *kept : {"hof.dat", "chatline.txt", "title.bmp", "dsg.ico", "eaw.exe"})
    EXPECT_TRUE(game.Exists(kept)) << kept;
  EXPECT_EQ(driver.Grid()->model()->index(0, 2).data().toString(), "");
  EXPECT_FALSE(driver.Grid()->model()->index(0, 1).data(Qt::BackgroundRole).isValid());
  EXPECT_EQ(fs::file_size(game.Path() / "ZEP128/FoldersLoaded.txt"), 0u);
  EXPECT_EQ(driver.Window().windowTitle().size(), 108);
}

TEST(ViewsWindow, HoverShowsDescriptionAndPictureOfTheRowEntered) {
  GameFolder game;
  game.WithCategories("Skins: S\r\n");
  game.Write("ZEP128/S-a/contents.TXT", "Line one\r\nLine two\nLine three");
  QImage picture(40, 30, QImage::Format_RGB32);
  picture.fill(Qt::red);
  picture.save(QString::fromStdString((game.MakeFolder("ZEP128/S-a") / "mypic").string()), "JPG");
  game.Write("ZEP128/S-b/a.jpg", "not a picture");
  WindowDriver driver(game.Path());
  auto *text = driver.Find<QPlainTextEdit>("Text9");
  auto *image = driver.Find<QLabel>("MyImage");

  HoverRow(driver, 1);
  EXPECT_EQ(driver.Find<QLabel>("MyLabel")->text(), "Line one\r\nLine two\r\nLine three\r\n");
  EXPECT_EQ(text->toPlainText(), "Line one\nLine two\nLine three\n");
  EXPECT_FALSE(image->pixmap().isNull());

  HoverRow(driver, 2);
  EXPECT_EQ(text->toPlainText(), "");
  EXPECT_TRUE(image->pixmap().isNull());
  EXPECT_TRUE(driver.TakeMessages().isEmpty());
}

TEST(ViewsWindow, TheSelectedCategoryShowsAgainTypingFindsAShownRowAndLoadedRowsAreBold) {
  GameFolder game;
  game.WithCategories("Skins: S\r\nSounds: N\r\n");
  for (const char *name : {"S-alpha", "S-beta", "N-bravo"})
    game.MakeFolder(std::string("ZEP128/") + name);
  WindowDriver driver(game.Path());
  ChooseCategory(driver, 3);
  ChooseCategory(driver, 2);
  QTest::mouseClick(driver.Find<QLabel>("Label33"), Qt::LeftButton);
  // A refresh keeps the category shown, its header and its letter.
  EXPECT_EQ(ShownFolders(driver), (QStringList{"S-alpha", "S-beta"}));
  EXPECT_EQ(Header(driver), "Only one selection can be made!");
  EXPECT_EQ(driver.Find<QLabel>("Label6")->text(), "S");
  EXPECT_EQ(driver.Find<QLabel>("Label22")->text(), "Refresh: 3 folders, 0 new, 0 gone");

  QTableView *grid = driver.Grid();
  grid->setFocus();
  QTest::keyClicks(grid, "S-b");
  EXPECT_EQ(grid->currentIndex().data().toString(), "S-beta");
  QTest::qWait(QApplication::keyboardInputInterval() + 50);
  QTest::keyClicks(grid, "N");
  EXPECT_EQ(grid->currentIndex().data().toString(), "S-beta");

  driver.ClickRow(2);
  const QModelIndex loaded = grid->model()->index(1, 1);
  EXPECT_TRUE(loaded.data(Qt::FontRole).value<QFont>().bold());
  EXPECT_FALSE(grid->model()->index(0, 1).data(Qt::FontRole).isValid());
  EXPECT_EQ(loaded.data(Qt::ToolTipRole).toString(), "S-beta");
}
