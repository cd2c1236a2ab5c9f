#include "ui/window_caption.h"

#include "platform/qt_paths.h"

#include <QCoreApplication>

WindowCaption::WindowCaption(QWidget *window, QLabel *progress)
    : QObject(window), window_(window), progress_(progress) {
  setObjectName("caption");
}

std::string WindowCaption::Get() const { return ToName(window_->windowTitle()); }

void WindowCaption::Set(const std::string &text) { window_->setWindowTitle(FromName(text)); }

// Megabytes with one decimal while they are few, so that a small total does not read "0 of 0".
static QString Megabytes(std::uint64_t bytes, bool fine) {
  const double megabytes = static_cast<double>(bytes) / (1 << 20);
  return QString::number(megabytes, 'f', fine ? 1 : 0);
}

void WindowCaption::Progress(const ProgressFigures &figures) {
  QString text = QString("Please wait: %1 of %2 files").arg(figures.done).arg(figures.total);
  if (figures.bytesTotal >= (1 << 20)) {
    const bool fine = figures.bytesTotal < (std::uint64_t{10} << 20);
    text += QString(", %1 of %2 MB")
                .arg(Megabytes(figures.bytesDone, fine), Megabytes(figures.bytesTotal, fine));
  }
  progress_->setText(text);
  emit ProgressShown();
  QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
}
