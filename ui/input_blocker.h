#pragma once

#include <QObject>

// Blocks the window while an operation runs: the pointer shows it is busy, and clicks and keys
// that arrive meanwhile are dropped when it ends, not replayed (a second click on a row would
// unload what was just loaded).
class InputBlocker : public QObject {
public:
  InputBlocker();
  ~InputBlocker() override;
  InputBlocker(const InputBlocker &) = delete;
  InputBlocker &operator=(const InputBlocker &) = delete;

protected:
  bool eventFilter(QObject *watched, QEvent *event) override;
};
