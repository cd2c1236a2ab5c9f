#pragma once

#include "app/selector.h"
#include "library/move_in.h"
#include "library/move_out.h"
#include "tests/game_folder.h"

#include <gtest/gtest.h>

#include <memory>
#include <utility>

// Adds what a verb could not do to `failures`, one collector for a test's run; returns the outcome.
inline Outcome Gathered(Outcome outcome, Failures &failures) {
  failures.Append(outcome.failures);
  return outcome;
}

// Clicks the first grid row named `folder`, gathering its failures into `failures`.
inline Outcome ClickFolder(Selector &selector, const std::string &folder, Failures &failures) {
  return Gathered(selector.ClickRow(RowOf(selector.State().Unigrid, folder)), failures);
}

// The mark of the first grid row named `folder`: "S" when loaded.
inline std::string MarkOf(const Selector &selector, const std::string &folder) {
  const FolderGrid &grid = selector.State().Unigrid;
  return IsLoaded(grid.Row(RowOf(grid, folder))) ? "S" : "";
}

// A fresh game folder and one collector of what could not be done: a failure that the test did
// not take fails it.
class GameTest : public ::testing::Test {
protected:
  void TearDown() override { EXPECT_TRUE(failures.Empty()) << failures.Message(""); }
  // The failures gathered so far, which the test expects.
  Failures Taken() { return std::exchange(failures, Failures{}); }

  GameFolder game;
  RecordingCaption caption;
  Failures failures;
};

// A Selector on a fresh game folder, for tests that drive the program's verbs.
class SelectorTest : public GameTest {
protected:
  Outcome Click(const std::string &folder) { return ClickFolder(*selector, folder, failures); }
  std::string Mark(const std::string &folder) const { return MarkOf(*selector, folder); }
  Outcome Gather(Outcome outcome) { return Gathered(std::move(outcome), failures); }
  // A new start of the program on the same game folder.
  void Restart() {
    selector = std::make_unique<Selector>(game.Path(), caption, starter);
    Gather(selector->StartUp());
  }

  NotingStarter starter;
  std::unique_ptr<Selector> selector = std::make_unique<Selector>(game.Path(), caption, starter);
};

// A game folder and the library state that loads and unloads its add-on folders directly.
class LibraryTest : public GameTest {
protected:
  // Whether the folder could be listed, and so was loaded in whole or part.
  bool Load(const std::string &folder) {
    return MoveIn(state, game.Library() / folder, caption, failures).has_value();
  }
  void Unload(const std::string &folder) {
    MoveOut(state, game.Library() / folder, caption, failures);
  }

  LibraryState state = LibraryFor(game.Path());
};
