#pragma once

#include "app/selector.h"
#include "base/caption.h"
#include "base/program_starter.h"

#include <filesystem>

// A Selector on a benchmark game folder, with a caption that draws nothing and no game to start.
struct QuietSelector {
  explicit QuietSelector(const std::filesystem::path &game) : selector(game, caption, starter) {}
  StoredCaption caption;
  NoProgramStarter starter;
  Selector selector;
};
