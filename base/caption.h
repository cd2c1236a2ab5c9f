#pragma once

#include <chrono>
#include <cstdint>
#include <string>

// How far a long file operation is.
struct ProgressFigures {
  int done = 0; // files begun, of `total`
  int total = 0;
  std::uint64_t bytesDone = 0; // bytes copied, of `bytesTotal`; 0 of 0 where nothing is copied
  std::uint64_t bytesTotal = 0;
};

// The main window's caption, which long file operations use as their progress line.
class Caption {
public:
  virtual ~Caption() = default;
  virtual std::string Get() const = 0;
  virtual void Set(const std::string &text) = 0;
  // How far a long operation is, shown beside the caption; a caption that cannot show it
  // ignores it.
  virtual void Progress(const ProgressFigures & /*figures*/) {}
  // How long an operation waits at least between two updates of the caption and the progress.
  virtual std::chrono::milliseconds ProgressInterval() const {
    return std::chrono::milliseconds(100);
  }
};

// A caption with no window to show it: keeps its text only, for the core run headless.
class StoredCaption : public Caption {
public:
  std::string Get() const override { return text_; }
  void Set(const std::string &text) override { text_ = text; }

private:
  std::string text_;
};

// Restores the caption it found when it goes out of scope.
class CaptionRestorer {
public:
  explicit CaptionRestorer(Caption &caption) : caption_(caption), saved_(caption.Get()) {}
  ~CaptionRestorer() { caption_.Set(saved_); }
  CaptionRestorer(const CaptionRestorer &) = delete;
  CaptionRestorer &operator=(const CaptionRestorer &) = delete;

private:
  Caption &caption_;
  std::string saved_;
};
