#pragma once

#include "base/caption.h"

#include <QElapsedTimer>
#include <QLabel>
#include <QWidget>

// The window's title as the progress line, with how far a long operation is ("120 of 2000
// files") in `progress`: each change is shown, and the window is repainted at most a few times a
// second so that long copies are not slowed down.
class WindowCaption : public Caption {
public:
  WindowCaption(QWidget *window, QLabel *progress);
  std::string Get() const override;
  void Set(const std::string &text) override;
  void Progress(int done, int total) override;

private:
  void RepaintNowAndThen();

  QWidget *window_;
  QLabel *progress_;
  QElapsedTimer sinceRepaint_;
};
