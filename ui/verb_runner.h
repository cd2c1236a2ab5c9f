#pragma once

#include "app/outcome.h"

#include <QLabel>
#include <QString>
#include <QWidget>
#include <functional>
#include <string>

// Runs the Selector's verbs for the window and tells the player each outcome the same way: the
// window drawn again, the summary line above the category list, the failure box, then the notice.
class VerbRunner {
public:
  // Long file work blocks the window's input while it runs; quick saves leave it open.
  enum class Input { blocked, open };

  // Boxes open over `window`; the summary takes the place of the instructions in `summaryLine`.
  VerbRunner(QWidget *window, QLabel *summaryLine);
  // Runs `verb`; `redraw` then draws what it changed and may add failures of its own (before
  // the summary line and the boxes). Failures are shown under `heading`, unless the outcome
  // brings a heading of its own. Returns whether the verb did what was asked.
  bool Run(Input input, const std::function<Outcome()> &verb, const QString &heading,
           const std::function<void(Outcome &)> &redraw = {});
  // Draws the summary line again, after a long operation's progress took its place.
  void ShowSummary();

private:
  QWidget *window_;
  QLabel *line_;
  std::string summary_; // the last action's line; empty shows the instructions
};
