#pragma once

#include "base/caption.h"

#include <chrono>
#include <cstdint>
#include <string>

// Shows how far a long file operation is, in the caption ("Please wait- copying: :a.dat (12 of
// 3003)") and beside it, no more often than the caption asks: the loop tells it of every file
// and of every chunk of a big copy, and most of those calls only read the clock.
class ProgressMeter {
public:
  ProgressMeter(Caption &caption, int totalFiles, std::uint64_t totalBytes = 0);
  // The next file begins. `doing` and `name` make the caption ("Deleting ", "X.DAT") and must
  // stay valid until the next call; `bytes` is what the file adds to the bytes done once copied.
  void NextFile(const char *doing, const std::string &name, std::uint64_t bytes = 0);
  // The next file begins, with a caption that names no file ("Please wait... cleaning up").
  void NextFile(const char *doing);
  // `copied` bytes of the current file are copied so far.
  void Copied(std::uint64_t copied);

private:
  void ShowNowAndThen();

  Caption &caption_;
  std::chrono::steady_clock::duration interval_;
  std::chrono::steady_clock::time_point due_; // the first file is shown at once
  ProgressFigures figures_;
  std::uint64_t finished_ = 0; // bytes of the files before the current one
  std::uint64_t current_ = 0;  // bytes of the current file
  const char *doing_ = "";
  const std::string *name_ = nullptr;
};
