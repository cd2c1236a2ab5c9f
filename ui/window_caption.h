#pragma once

#include "base/caption.h"

#include <QElapsedTimer>
#include <QWidget>

// The window's title as the progress line: each change is shown, and the window is repainted at
// most a few times a second so that long copies are not slowed down.
class WindowCaption : public Caption {
public:
  explicit WindowCaption(QWidget *window);
  std::string Get() const override;
  void Set(const std::string &text) override;

private:
  QWidget *window_;
  QElapsedTimer sinceRepaint_;
};
