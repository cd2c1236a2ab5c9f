#pragma once

#include "ui/main_window.h"

#include <QAbstractItemModelTester>
#include <QMessageBox>
#include <QStringList>
#include <QTableView>
#include <functional>
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
  // Clicks the name cell of folder row `row` (1 is the first folder).
  void ClickRow(int row, int column = 1);
  // The mark column of folder row `row` (1 is the first folder): "S" when loaded.
  QString Mark(int row);
  // The line that sums up the last action.
  QString Summary();
  // Does `action`, which asks a question, answers it with `button` (NoButton: the box's default
  // button, as Enter would) and returns the question's text.
  QString AnswerNextBox(QMessageBox::StandardButton button, const std::function<void()> &action);
  // The texts of the message boxes the window has shown since the last call; closes them.
  QStringList TakeMessages();

private:
  std::unique_ptr<MainWindow> window_;
  // Checks every change of the folder grid's model against Qt's rules for item models.
  std::unique_ptr<QAbstractItemModelTester> gridModelTester_;
};
