#include "tests/window_driver.h"

#include "platform/qt_paths.h"
#include "tests/game_folder.h"
#include "ui/failure_box.h"

#include <QApplication>
#include <QLabel>
#include <QListWidget>
#include <QMessageBox>

WindowDriver::WindowDriver(const std::filesystem::path &eawDir)
    : window_(std::make_unique<MainWindow>(eawDir)),
      gridModelTester_(std::make_unique<QAbstractItemModelTester>(
          Grid()->model(), QAbstractItemModelTester::FailureReportingMode::Fatal)) {
  window_->FormLoad();
  window_->show();
  window_->findChild<QTabWidget *>("SSTab1")->setCurrentIndex(1);
  QApplication::processEvents();
}

void WindowDriver::ClickRow(int row, int column) {
  QTableView *grid = Grid();
  grid->scrollTo(Cell(row, column));
  QTest::mouseClick(grid->viewport(), Qt::LeftButton, {},
                    grid->visualRect(Cell(row, column)).center());
}

void WindowDriver::HoverRow(int row) {
  QTest::mouseMove(Grid()->viewport(), Grid()->visualRect(Cell(row)).center());
}

void WindowDriver::ClickEntry(const char *list, int entry) {
  auto *widget = Find<QListWidget>(list);
  QTest::mouseClick(widget->viewport(), Qt::LeftButton, {},
                    widget->visualItemRect(widget->item(entry)).center());
}

QString WindowDriver::Mark(int row) { return Cell(row, 2).data().toString(); }

QString WindowDriver::Summary() { return Find<QLabel>("Label22")->text(); }

QString WindowDriver::AnswerNextBox(QMessageBox::StandardButton button,
                                    const std::function<void()> &action) {
  QString text;
  SetNextAnswer([&](const QMessageBox &box) {
    text = box.text();
    return button == QMessageBox::NoButton ? box.standardButton(box.defaultButton()) : button;
  });
  action();
  return text;
}

QStringList WindowDriver::TakeMessages() {
  QApplication::processEvents();
  QStringList texts;
  for (QMessageBox *box : window_->findChildren<QMessageBox *>()) {
    if (!box->isVisible())
      continue;
    texts << box->text();
    box->close();
  }
  QApplication::processEvents();
  return texts;
}

testing::AssertionResult WindowDriver::OneMessage(std::initializer_list<QString> parts) {
  const QStringList texts = TakeMessages();
  bool holds = texts.size() == 1;
  for (const QString &part : parts)
    holds = holds && texts[0].contains(part);
  if (holds)
    return testing::AssertionSuccess();
  return testing::AssertionFailure() << "messages: " << texts.join(" | ").toStdString();
}

void MakeStandInGame(GameFolder &game, int status) {
#ifdef _WIN32
  // Windows keeps a running program's file from being replaced, and one started earlier may
  // still run: the program stays, and only its status changes.
  fs::copy_file(ToPath(QCoreApplication::applicationDirPath()) / "stand_in_game.exe",
                game.Path() / "eaw.exe", fs::copy_options::skip_existing);
  game.Write("exit-status", std::to_string(status));
#else
  const fs::path exe =
      game.Write("eaw.exe", "#!/bin/sh\ntouch \"$(dirname \"$0\")/started-$$\"\nexit " +
                                std::to_string(status) + "\n");
  fs::permissions(exe, fs::perms::owner_exec, fs::perm_options::add);
#endif
}
