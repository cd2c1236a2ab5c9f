#include "ui/held_key.h"

namespace {
// No hand lets a key go and presses it again this fast; a held key's release and press come
// together.
constexpr qint64 kRepeatGapMs = 30;
} // namespace

bool HeldKey::FreshPress(const QKeyEvent &event) {
  if (event.type() == QEvent::KeyRelease) {
    sinceRelease_.start();
    return false;
  }
  if (event.isAutoRepeat())
    return false;
  return !sinceRelease_.isValid() || sinceRelease_.elapsed() >= kRepeatGapMs;
}
