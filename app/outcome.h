#pragma once

#include "base/failures.h"

#include <optional>
#include <string>
#include <utility>

// What a verb that changes something tells the player, all in one place.
struct Outcome {
  // The line that sums up the action and stays until the next: empty clears it; nothing leaves
  // the line shown before.
  std::optional<std::string> summary;
  // What the player should read beyond failures: a first line, then details; empty for none.
  std::string notice;
  // What could not be done, told once in one message.
  Failures failures;
  // Whether the verb did what was asked (saved, switched, deleted); `failures` say why not.
  bool done = false;
};

// `outcome` with the failures of what the caller asked before the verb told first, in one message.
inline Outcome AfterAsking(Failures asked, Outcome outcome) {
  asked.Append(outcome.failures);
  outcome.failures = std::move(asked);
  return outcome;
}
