#pragma once

#include "app/selector.h"
#include "tests/game_folder.h"

#include <gtest/gtest.h>

// A Selector on a fresh game folder, for tests that drive the program's verbs.
class SelectorTest : public ::testing::Test {
protected:
  GameFolder game;
  RecordingCaption caption;
  NotingStarter starter;
  Selector selector{game.Path(), caption, starter};
  Failures failures;
};
