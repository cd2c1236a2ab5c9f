#include "ui/verb_runner.h"

#include "platform/qt_paths.h"
#include "ui/failure_box.h"
#include "ui/fitted_text.h"
#include "ui/input_blocker.h"
#include "ui/window_layout.h"

#include <optional>

VerbRunner::VerbRunner(QWidget *window, QLabel *summaryLine)
    : window_(window), line_(summaryLine) {}

bool VerbRunner::Run(Input input, const std::function<Outcome()> &verb, const QString &heading,
                     const std::function<void(Outcome &)> &redraw) {
  Outcome outcome;
  {
    std::optional<InputBlocker> blocker;
    if (input == Input::blocked)
      blocker.emplace();
    outcome = verb();
  }
  if (redraw)
    redraw(outcome);
  if (outcome.summary)
    summary_ = *outcome.summary;
  ShowSummary();
  ShowFailures(window_, outcome.failures, heading);
  ShowNotice(window_, outcome.notice);
  return outcome.done;
}

// The line that sums up the last action takes the place of the instructions above the category
// list until the next action; cut to the label's lines, whole in its tooltip.
void VerbRunner::ShowSummary() {
  const QString summary = FromName(summary_);
  line_->setText(summary.isEmpty() ? QString(kInstructions) : FittedText(line_, summary));
  line_->setToolTip(summary);
}
