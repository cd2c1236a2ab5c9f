#include "tests/window_driver.h"

#include <QApplication>
#include <QMessageBox>
#include <QTest>
#include <QTimer>

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
  const QModelIndex index = grid->model()->index(row - 1, column);
  grid->scrollTo(index);
  QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, grid->visualRect(index).center());
}

void WindowDriver::PressGridKey(int key) { QTest::keyClick(Grid(), static_cast<Qt::Key>(key)); }

QString WindowDriver::AnswerNextBox(QMessageBox::StandardButton button,
                                    const std::function<void()> &action) {
  QString text;
  QTimer::singleShot(0, [&] {
    auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
    if (!box)
      return;
    text = box->text();
    box->button(button)->click();
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
