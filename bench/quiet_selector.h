#pragma once

#include "app/selector.h"
#include "base/caption.h"
#include "base/program_starter.h"

#include <filesystem>
#include <string>

// Keeps the caption's text only: the benchmark measures file work, not drawing.
class StoredCaption : public Caption {
public:
  std::string Get() const override { return text_; }
  void Set(const std::string &text) override { text_ = text; }

private:
  std::string text_;
};

// Starts nothing: the benchmark never starts the game.
class NoStarter : public ProgramStarter {
public:
  bool StartDetached(const std::filesystem::path &, bool) override { return false; }
};

// A started Selector on a benchmark game folder, with its caption and starter.
struct QuietSelector {
  explicit QuietSelector(const std::filesystem::path &game) : selector(game, caption, starter) {}
  StoredCaption caption;
  NoStarter starter;
  Selector selector;
};
