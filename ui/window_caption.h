#pragma once

#include "base/caption.h"

#include <QLabel>
#include <QObject>
#include <QWidget>

// The window's title as the progress line, with how far a long operation is ("120 of 2000
// files, 3 of 400 MB") in `progress`. The operation tells it a few times a second; each time the
// window is repainted.
class WindowCaption : public QObject, public Caption {
  Q_OBJECT
public:
  WindowCaption(QWidget *window, QLabel *progress);
  std::string Get() const override;
  void Set(const std::string &text) override;
  void Progress(const ProgressFigures &figures) override;

signals:
  // The progress was shown; the window repaints right after.
  void ProgressShown();

private:
  QWidget *window_;
  QLabel *progress_;
};
