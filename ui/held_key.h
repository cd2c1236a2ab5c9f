#pragma once

#include <QElapsedTimer>
#include <QKeyEvent>

// Tells the first press of a key from what the platform sends while the key is held: presses
// marked as repeats (Windows, and X where it reports repeats), or a release at once followed by
// a press (X where it does not).
class HeldKey {
public:
  // Whether `event`, a press or release of the key, is a fresh press that may act.
  bool FreshPress(const QKeyEvent &event);

private:
  QElapsedTimer sinceRelease_;
};
