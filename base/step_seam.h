#pragma once

#include <functional>

// A point after each file change that commits a step of an operation (a rename, a finished copy,
// a deletion). Tests stop an operation there, as a crash would, to check what the next start
// makes of it; without a hook it does nothing.
void StepDone();
// Sets the hook StepDone calls; an empty one removes it.
void SetStepHook(std::function<void()> hook);
