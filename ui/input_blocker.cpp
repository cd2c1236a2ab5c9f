#include "ui/input_blocker.h"

#include <QApplication>
#include <QEvent>

InputBlocker::InputBlocker() {
  QCoreApplication::instance()->installEventFilter(this);
  QApplication::setOverrideCursor(Qt::WaitCursor);
}

InputBlocker::~InputBlocker() {
  // Input held back while the operation ran arrives now and is dropped here.
  QCoreApplication::processEvents();
  QCoreApplication::instance()->removeEventFilter(this);
  QApplication::restoreOverrideCursor();
}

bool InputBlocker::eventFilter(QObject *, QEvent *event) {
  switch (event->type()) {
  case QEvent::MouseButtonPress:
  case QEvent::MouseButtonRelease:
  case QEvent::MouseButtonDblClick:
  case QEvent::KeyPress:
  case QEvent::KeyRelease:
  case QEvent::Wheel:
  case QEvent::Shortcut:
    return true;
  default:
    return false;
  }
}
