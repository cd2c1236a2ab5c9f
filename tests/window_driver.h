#pragma once

#include "ui/main_window.h"

#include <QAbstractItemModelTester>
#include <QMessageBox>
#include <QStringList>
#include <QTableView>
#include <QTest>
#include <functional>
#include <gtest/gtest.h>
#include <initializer_list>
#include <memory>

class GameFolder;

// Puts an eaw.exe into `game` that leaves a "started-<process id>" file beside itself and ends
// with `status`: a shell script, which only POSIX systems run, or on Windows a small program built
// with the tests.
void MakeStandInGame(GameFolder &game, int status = 0);

// A started main window for a game folder, and the few ways a person works it.
class WindowDriver {
public:
  explicit WindowDriver(const std::filesystem::path &eawDir);

  MainWindow &Window() { return *window_; }
  template <class Widget> Widget *Find(const char *name) {
    return window_->findChild<Widget *>(name);
  }
  QTableView *Grid() { return Find<QTableView>("Unigrid"); }
  // The grid's cell of folder row `row` (1 is the first folder).
  QModelIndex Cell(int row, int column = 1) { return Grid()->model()->index(row - 1, column); }
  // Clicks the name cell of folder row `row` (1 is the first folder).
  void ClickRow(int row, int column = 1);
  // Moves the pointer over the name cell of folder row `row` (1 is the first folder).
  void HoverRow(int row);
  // Clicks the button or label called `name`.
  void Click(const char *name) { QTest::mouseClick(Find<QWidget>(name), Qt::LeftButton); }
  // Clicks entry `entry` (0 is the first) of the list called `list`.
  void ClickEntry(const char *list, int entry);
  // The mark column of folder row `row` (1 is the first folder): "S" when loaded.
  QString Mark(int row);
  // The line that sums up the last action.
  QString Summary();
  // Does `action`, which asks a question, answers it with `button` (NoButton: the box's default
  // button, as Enter would) and returns the question's text.
  QString AnswerNextBox(QMessageBox::StandardButton button, const std::function<void()> &action);
  // The texts of the message boxes the window has shown since the last call; closes them.
  QStringList TakeMessages();
  // Passes when the window shows one message box whose text holds each of `parts`; closes it.
  testing::AssertionResult OneMessage(std::initializer_list<QString> parts);

private:
  std::unique_ptr<MainWindow> window_;
  // Checks every change of the folder grid's model against Qt's rules for item models.
  std::unique_ptr<QAbstractItemModelTester> gridModelTester_;
};
