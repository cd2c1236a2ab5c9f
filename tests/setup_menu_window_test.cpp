#include "tests/game_folder.h"
#include "tests/window_driver.h"

#include <QAbstractItemModelTester>
#include <QApplication>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QHeaderView>
#include <QInputDialog>
#include <QMenu>
#include <QPushButton>
#include <QTest>
#include <gtest/gtest.h>

namespace {

// Opens the folder grid's menu: a right-click on folder row `row`, or the menu key on the current
// row when `row` is 0. The test platform turns neither into a context-menu event by itself.
QMenu *OpenMenu(WindowDriver &driver, int row) {
  QTableView *grid = driver.Grid();
  qDeleteAll(driver.Window().findChildren<QMenu *>("FolderGridMenu"));
  if (row > 0) {
    const QPoint at = grid->visualRect(driver.Cell(row)).center();
    QTest::mouseClick(grid->viewport(), Qt::RightButton, {}, at);
    QContextMenuEvent click(QContextMenuEvent::Mouse, at, grid->viewport()->mapToGlobal(at));
    QApplication::sendEvent(grid->viewport(), &click);
  } else {
    QTest::keyClick(grid, Qt::Key_Menu);
    QContextMenuEvent key(QContextMenuEvent::Keyboard, {}, grid->mapToGlobal(QPoint()));
    QApplication::sendEvent(grid, &key);
  }
  QApplication::processEvents();
  return driver.Window().findChild<QMenu *>("FolderGridMenu");
}

// Chooses the entry `path` of the menu (a submenu's title, then its entry).
void Choose(QMenu *menu, const QStringList &path) {
  ASSERT_NE(menu, nullptr);
  for (const QString &text : path) {
    QAction *found = nullptr;
    for (QAction *action : menu->actions())
      if (action->text() == text)
        found = action;
    ASSERT_NE(found, nullptr) << text.toStdString();
    ASSERT_TRUE(found->isEnabled()) << text.toStdString();
    if (found->menu())
      menu = found->menu();
    else
      found->trigger();
  }
  QApplication::processEvents();
}

} // namespace

TEST(SetupMenuWindow, SavesSwitchesDeletesAndCopiesSetupsAndShowsAFoldersFiles) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Skins: S\r\nSounds: N\r\n");
  game.Addon("S-a", {"a.dat"});
  game.Addon("N-x", {"x.wav"});
  game.Addon("N-y", {"y.wav"});
  game.Addon("N-a", {"z.dat"});
  for (int i = 10; i < 25; ++i) {
    game.Write("ZEP128/N-a/f" + std::to_string(i) + ".dat");
    game.Write("ZEP128/N-b/f" + std::to_string(i) + ".dat");
  }
  WindowDriver driver(game.Path());
  driver.ClickRow(5);
  driver.ClickRow(4);

  QMenu *menu = OpenMenu(driver, 1);
  ASSERT_NE(menu, nullptr);
  EXPECT_FALSE(game.Exists("a.dat")); // a right-click loads nothing
  QStringList entries;
  for (QAction *action : menu->actions())
    entries << action->text() + (action->isEnabled() ? "" : " (off)");
  EXPECT_EQ(entries, (QStringList{"Files of this folder…", "", "Save loaded folders as a setup…",
                                  "Switch to setup (off)", "Delete setup (off)", "",
                                  "Copy list of loaded folders"}));
  Choose(menu, {"Copy list of loaded folders"});
  EXPECT_EQ(QGuiApplication::clipboard()->text(), "N-y\nN-x\n");

  Choose(OpenMenu(driver, 0), {"Save loaded folders as a setup…"});
  auto *ask = driver.Find<QInputDialog>("SetupNameDialog");
  ASSERT_NE(ask, nullptr);
  ask->setTextValue(" Two sounds ");
  ask->accept();
  EXPECT_EQ(game.Read("ZEP128/#Selector/setups/Two sounds.txt"), "N-y\r\nN-x\r\n");
  EXPECT_EQ(driver.Summary(), "Saved 2 loaded folders as \"Two sounds\".");

  driver.ClickRow(5);
  driver.ClickRow(1);
  Choose(OpenMenu(driver, 1), {"Switch to setup", "Two sounds"});
  EXPECT_TRUE(
      driver.Summary().startsWith("Switched to \"Two sounds\": 2 folders unloaded, 2 loaded"));
  EXPECT_EQ(driver.Mark(5) + driver.Mark(1), "S");

  Choose(OpenMenu(driver, 1), {"Delete setup", "Two sounds"});
  auto *sure = driver.Find<QMessageBox>("ConfirmDeleteSetup");
  ASSERT_NE(sure, nullptr);
  sure->button(QMessageBox::Yes)->click();
  EXPECT_FALSE(game.Exists("ZEP128/#Selector/setups/Two sounds.txt"));
  EXPECT_TRUE(driver.Summary().startsWith("Switched to")); // a deletion keeps the line

  EXPECT_TRUE(driver.TakeMessages().isEmpty());

  driver.ClickRow(2);
  driver.ClickRow(3);
  EXPECT_TRUE(driver.OneMessage({"\"N-b\" replaced files of \"N-a\"", "\n... and 3 more."}));

  Choose(OpenMenu(driver, 2), {"Files of this folder…"});
  auto *table = driver.Find<QTableView>("FolderFilesTable");
  ASSERT_NE(table, nullptr);
  QAbstractItemModel *files = table->model();
  QAbstractItemModelTester tester(files, QAbstractItemModelTester::FailureReportingMode::Fatal);
  ASSERT_EQ(files->rowCount(), 16);
  EXPECT_EQ(files->index(0, 0).data().toString(), "f10.dat");
  EXPECT_EQ(files->index(0, 2).data().toString(), "replaced by \"N-b\", loaded later");
  EXPECT_EQ(files->index(0, 3).data().toString(), "N-b");
  QHeaderView *header = table->horizontalHeader();
  for (const char *first : {"z.dat", "f10.dat"}) {
    QTest::mouseClick(header->viewport(), Qt::LeftButton, {},
                      QPoint(header->sectionViewportPosition(2) + 5, 5));
    EXPECT_EQ(files->index(0, 0).data().toString(), first);
  }
  EXPECT_TRUE(driver.Find<QLabel>("FolderFilesHeading")->text().contains("names: \"N-b\" (15)."));
}
