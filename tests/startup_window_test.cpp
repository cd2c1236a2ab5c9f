#include "app/category_file.h"
#include "platform/instance_lock.h"
#include "platform/qt_paths.h"
#include "tests/game_folder.h"
#include "tests/window_driver.h"
#include "ui/duplicate_instance.h"
#include "ui/run_selector.h"

#include <QApplication>
#include <QFontInfo>
#include <QMessageBox>
#include <QPlainTextEdit>
#include <QProcess>
#include <QPushButton>
#include <QTest>
#include <QTimer>
#include <gtest/gtest.h>

TEST(StartupWindow, FirstStartCreatesTheLibraryShowsTheControlsMinimisesAndExits) {
  GameFolder game;
  WindowDriver driver(game.Path());
  EXPECT_EQ(game.Read("ZEP128/zep.ini"), DefaultCategoryText());
  EXPECT_EQ(fs::file_size(game.Path() / "ZEP128/FoldersLoaded.txt"), 0u);
  EXPECT_EQ(driver.Grid()->model()->rowCount(), 0);
  EXPECT_EQ(driver.Find<QListWidget>("List3")->count(), 29);
  EXPECT_TRUE(driver.TakeMessages().isEmpty());

  MainWindow &window = driver.Window();
  EXPECT_TRUE(window.windowTitle().startsWith("ZEP for 150 "));
  EXPECT_EQ(driver.Summary(), kInstructions);
  EXPECT_FALSE(driver.Find<QWidget>("Frame21")->isVisible());
  EXPECT_TRUE(driver.Grid()->isColumnHidden(0));
  // One font everywhere, also inside the frames that have style sheets.
  const QFontInfo windowFont(window.font());
  for (const char *name : {"Label5", "Text5", "SlotLabel", "Label9"}) {
    const QFontInfo font(driver.Find<QWidget>(name)->font());
    EXPECT_EQ(font.family(), windowFont.family()) << name;
    EXPECT_EQ(font.pointSizeF(), windowFont.pointSizeF()) << name;
  }
  driver.Click("Command8");
  EXPECT_TRUE(window.windowState() & Qt::WindowMinimized);
  driver.Click("Command3");
  EXPECT_FALSE(window.isVisible());
}

TEST(StartupWindow, RecordedFoldersShowGreenAfterARestart) {
  GameFolder game;
  game.WithCategories("Skins: S\r\nSounds: N\r\n");
  game.Write("ZEP128/S-one/a.dat");
  game.Write("ZEP128/N-two/b.dat");
  game.WithRecord("N-two\r\n\r\n");
  WindowDriver driver(game.Path());
  ASSERT_EQ(driver.Grid()->model()->rowCount(), 2);
  EXPECT_EQ(driver.Cell(2).data().toString(), "N-two");
  EXPECT_EQ(driver.Mark(2), "S");
  EXPECT_EQ(driver.Cell(2).data(Qt::BackgroundRole).value<QColor>(), QColor(192, 255, 192));
  EXPECT_FALSE(driver.Cell(1).data(Qt::BackgroundRole).isValid());
  EXPECT_FALSE(game.Exists("b.dat"));
  EXPECT_EQ(driver.Grid()->height(),
            53 + driver.Grid()->style()->pixelMetric(QStyle::PM_ScrollBarExtent));
}

// The system releases the lock of an instance that is killed, whatever process ids are reused.
TEST(StartupWindow, ASecondInstanceIsRefusedAndTouchesNoFileAKilledOneLeavesNoLock) {
  GameFolder game;
  QProcess holder;
  holder.start(QCoreApplication::applicationFilePath(),
               {"--hold-instance-lock", FromPath(game.Path())});
  ASSERT_TRUE(holder.waitForReadyRead(60000));
  ASSERT_EQ(holder.readAll().trimmed(), "held");
  bool asked = false;
  QTimer::singleShot(0, [&] {
    auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
    ASSERT_NE(box, nullptr);
    asked = true;
    EXPECT_EQ(box->windowTitle(), "Hang On...........");
    EXPECT_EQ(box->text(), DuplicateInstanceText());
    EXPECT_EQ(box->icon(), QMessageBox::Warning);
    EXPECT_EQ(box->buttons().size(), 1);
    box->button(QMessageBox::Ok)->click();
  });
  EXPECT_EQ(RunSelector(game.Path()), 0);
  EXPECT_TRUE(asked);
  EXPECT_TRUE(fs::is_empty(game.Path()));
  holder.kill();
  ASSERT_TRUE(holder.waitForFinished(60000));
  EXPECT_TRUE(InstanceLock(game.Path()).Acquired());
}

TEST(StartupWindow, AHugeCategoryFileGivesABoxThatFitsTheScreen) {
  GameFolder game;
  std::string lines;
  for (int line = 0; line < 40000; ++line)
    lines += "no colon, line " + std::to_string(line) + "\r\n";
  game.WithCategories("Skins: S\r\n" + lines + std::string(10000, 'x') + "\r\n");
  WindowDriver driver(game.Path());
  const QList<QMessageBox *> boxes = driver.Window().findChildren<QMessageBox *>();
  ASSERT_EQ(boxes.size(), 1);
  EXPECT_LT(boxes[0]->sizeHint().height(), 700);
  EXPECT_LT(boxes[0]->sizeHint().width(), 1400);
  EXPECT_TRUE(boxes[0]->text().endsWith("... and 39990 more."));
  EXPECT_TRUE(boxes[0]->detailedText().contains("no colon, line 4000"));
  EXPECT_EQ(driver.Find<QListWidget>("List3")->count(), 3);
}
