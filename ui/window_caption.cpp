#include "ui/window_caption.h"

#include "platform/qt_paths.h"

#include <QCoreApplication>

namespace {
constexpr qint64 kRepaintIntervalMs = 200;
}

WindowCaption::WindowCaption(QWidget *window, QLabel *progress)
    : window_(window), progress_(progress) {
  sinceRepaint_.start();
}

std::string WindowCaption::Get() const { return ToName(window_->windowTitle()); }

void WindowCaption::Set(const std::string &text) {
  window_->setWindowTitle(FromName(text));
  RepaintNowAndThen();
}

void WindowCaption::Progress(int done, int total) {
  progress_->setText(QString("Please wait: %1 of %2 files").arg(done).arg(total));
  RepaintNowAndThen();
}

void WindowCaption::RepaintNowAndThen() {
  if (sinceRepaint_.elapsed() >= kRepaintIntervalMs) {
    QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
    sinceRepaint_.restart();
  }
}
