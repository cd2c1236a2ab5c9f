#pragma once

#include <string>

// The main window's caption, which long file operations use as their progress line.
class Caption {
public:
  virtual ~Caption() = default;
  virtual std::string Get() const = 0;
  virtual void Set(const std::string &text) = 0;
  // How far a long operation is: file `done` of `total`. Shown beside the caption, whose text
  // stays as it is; a caption that cannot show it ignores it.
  virtual void Progress(int /*done*/, int /*total*/) {}
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
