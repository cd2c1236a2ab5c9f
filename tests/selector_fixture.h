#pragma once

#include "app/selector.h"
#include "tests/game_folder.h"

#include <gtest/gtest.h>

// Clicks the first grid row named `folder`; returns the click's notice.
inline std::string ClickFolder(Selector &selector, const std::string &folder, Failures &failures) {
  return selector.ClickRow(RowOf(selector.State().Unigrid, folder), failures);
}

// The mark of the first grid row named `folder`: "S" when loaded.
inline std::string MarkOf(const Selector &selector, const std::string &folder) {
  const FolderGrid &grid = selector.State().Unigrid;
  return IsLoaded(grid.Row(RowOf(grid, folder))) ? "S" : "";
}

// A Selector on a fresh game folder, for tests that drive the program's verbs.
class SelectorTest : public ::testing::Test {
protected:
  std::string Click(const std::string &folder) { return ClickFolder(selector, folder, failures); }
  std::string Mark(const std::string &folder) const { return MarkOf(selector, folder); }

  GameFolder game;
  RecordingCaption caption;
  NotingStarter starter;
  Selector selector{game.Path(), caption, starter};
  Failures failures;
};
