#include "base/step_seam.h"

static std::function<void()> &Hook() {
  static std::function<void()> hook;
  return hook;
}

void StepDone() {
  if (Hook())
    Hook()();
}

void SetStepHook(std::function<void()> hook) { Hook() = std::move(hook); }
