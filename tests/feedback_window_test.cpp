#include "tests/game_folder.h"
#include "tests/window_driver.h"
#include "ui/window_caption.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QTest>
#include <gtest/gtest.h>

namespace {

// Runs `post` the first time the window shows how far an operation is: what it posts waits in
// the queue while the operation runs, as a person's input does.
void WhileBusy(WindowDriver &driver, std::function<void()> post) {
  auto *caption = driver.Window().findChild<WindowCaption *>("caption");
  auto connection = std::make_shared<QMetaObject::Connection>();
  *connection = QObject::connect(caption, &WindowCaption::ProgressShown, [=] {
    QObject::disconnect(*connection);
    post();
  });
}

QKeyEvent *Enter(QEvent::Type type, bool repeat) {
  return new QKeyEvent(type, Qt::Key_Return, Qt::NoModifier, "\r", repeat);
}

// What a platform sends for each repeat of a held key: X a release and a press, marked as
// repeats or not; Windows a press marked as a repeat.
enum class Held { XMarked, XPairs, Windows };

// Three repeats of a held key.
std::vector<QKeyEvent *> Repeats(Held held) {
  std::vector<QKeyEvent *> events;
  for (int repeat = 0; repeat < 3; ++repeat) {
    if (held != Held::Windows)
      events.push_back(Enter(QEvent::KeyRelease, held == Held::XMarked));
    events.push_back(Enter(QEvent::KeyPress, held != Held::XPairs));
  }
  return events;
}

void Send(QObject *target, QEvent *event) {
  QApplication::sendEvent(target, event);
  delete event;
}

class HeldEnter : public testing::TestWithParam<Held> {};

} // namespace

TEST_P(HeldEnter, ActsOnceWhateverThePlatformSendsWhileItIsHeld) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Singles: Q\r\n");
  game.Addon("Q-One", {"a.dat"});
  WindowDriver driver(game.Path());
  QTableView *grid = driver.Grid();
  grid->setCurrentIndex(driver.Cell(1));
  WhileBusy(driver, [&] {
    for (QKeyEvent *event : Repeats(GetParam()))
      QCoreApplication::postEvent(grid, event);
  });
  Send(grid, Enter(QEvent::KeyPress, false));
  for (QKeyEvent *event : Repeats(GetParam()))
    Send(grid, event);
  Send(grid, Enter(QEvent::KeyRelease, false));
  QApplication::processEvents();
  EXPECT_EQ(driver.Mark(1), "S");

  // The next press is a fresh one.
  QTest::qWait(50);
  Send(grid, Enter(QEvent::KeyPress, false));
  EXPECT_EQ(driver.Mark(1), "");
}

INSTANTIATE_TEST_SUITE_P(Platforms, HeldEnter,
                         testing::Values(Held::XMarked, Held::XPairs, Held::Windows));

// A big file shows its bytes in the summary line and its place in the caption; what is put in while
// it loads waits in the queue and is dropped.
TEST(FeedbackWindow, ABigLoadShowsItsProgressAndDropsInputQueuedMeanwhile) {
  GameFolder game;
  game.WithGameFolders().WithCategories("Singles: Q\r\n");
  game.Write("ZEP128/Q-Big/big.dat", std::string(9 << 20, 'x'));
  game.Write("ZEP128/Q-Two/contents.txt", "second folder");
  WindowDriver driver(game.Path());
  const QString caption = driver.Window().windowTitle();
  auto *refresh = driver.Find<QLabel>("Label33");
  QWidget *rows = driver.Grid()->viewport();
  const QPoint second = driver.Grid()->visualRect(driver.Cell(2)).center();
  WhileBusy(driver, [&] {
    game.MakeFolder("ZEP128/Q-Three");
    QCoreApplication::postEvent(refresh, new QMouseEvent(QEvent::MouseButtonPress, QPointF(2, 2),
                                                         refresh->mapToGlobal(QPointF(2, 2)),
                                                         Qt::LeftButton, Qt::LeftButton, {}));
    QCoreApplication::postEvent(rows, new QMouseEvent(QEvent::MouseMove, second,
                                                      rows->mapToGlobal(QPointF(second)),
                                                      Qt::NoButton, Qt::NoButton, {}));
  });
  QStringList lines, captions;
  QObject::connect(driver.Window().findChild<WindowCaption *>("caption"),
                   &WindowCaption::ProgressShown, [&] {
                     lines << driver.Summary();
                     captions << driver.Window().windowTitle();
                   });
  driver.ClickRow(1);
  // The button is let go after the load: a release alone is no click on "Refresh!".
  QTest::mouseRelease(refresh, Qt::LeftButton, {}, QPoint(2, 2));
  QApplication::processEvents();
  EXPECT_EQ(lines.value(0), "Please wait: 1 of 1 files, 0.0 of 9.0 MB");
  EXPECT_EQ(captions.value(0), "Please wait- copying: :big.dat (1 of 1)");
  EXPECT_EQ(driver.Window().windowTitle(), caption);
  EXPECT_EQ(driver.Mark(1), "S");
  EXPECT_EQ(driver.Grid()->model()->rowCount(), 2);
  EXPECT_FALSE(driver.Find<QPlainTextEdit>("Text9")->toPlainText().contains("second"));
}

TEST(FeedbackWindow, AStartThatFinishedAnInterruptedUnloadShowsTheInstructions) {
  GameFolder game;
  game.WithCategories("Sounds: N\r\n");
  game.Addon("N-A", {"a.dat", "b.dat"});
  game.Write("a.dat");
  game.Write("b.dat");
  game.Write("ZEP128/#Selector/journal.txt", "unload\r\nN-A\r\n\tG-a.dat\r\n\tG-b.dat\r\n");
  WindowDriver driver(game.Path());
  EXPECT_EQ(driver.Summary(), kInstructions);
}
