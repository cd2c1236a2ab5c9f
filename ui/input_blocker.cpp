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

// Every input event goes: a pointer move made meanwhile would show the preview of a row that
// has changed under it, and a release would finish a click whose press was dropped.
bool InputBlocker::eventFilter(QObject *, QEvent *event) {
  return event->isInputEvent() || event->type() == QEvent::Shortcut ||
         event->type() == QEvent::ShortcutOverride;
}
