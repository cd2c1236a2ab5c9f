#include "ui/window_caption.h"

#include "platform/qt_paths.h"

#include <QCoreApplication>

namespace {
constexpr qint64 kRepaintIntervalMs = 200;
}

WindowCaption::WindowCaption(QWidget *window) : window_(window) { sinceRepaint_.start(); }

std::string WindowCaption::Get() const { return ToName(window_->windowTitle()); }

void WindowCaption::Set(const std::string &text) {
  window_->setWindowTitle(FromName(text));
  if (sinceRepaint_.elapsed() >= kRepaintIntervalMs) {
    QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
    sinceRepaint_.restart();
  }
}
