#include "base/progress_meter.h"

ProgressMeter::ProgressMeter(Caption &caption, int totalFiles, std::uint64_t totalBytes)
    : caption_(caption), interval_(caption.ProgressInterval()) {
  figures_.total = totalFiles;
  figures_.bytesTotal = totalBytes;
}

void ProgressMeter::NextFile(const char *doing, const std::string &name, std::uint64_t bytes) {
  finished_ += current_;
  current_ = bytes;
  ++figures_.done;
  figures_.bytesDone = finished_;
  doing_ = doing;
  name_ = &name;
  ShowNowAndThen();
}

void ProgressMeter::NextFile(const char *doing) {
  static const std::string kNoName;
  NextFile(doing, kNoName);
}

void ProgressMeter::Copied(std::uint64_t copied) {
  figures_.bytesDone = finished_ + copied;
  ShowNowAndThen();
}

void ProgressMeter::ShowNowAndThen() {
  const auto now = std::chrono::steady_clock::now();
  if (now < due_)
    return;
  due_ = now + interval_;
  caption_.Set(doing_ + *name_ + " (" + std::to_string(figures_.done) + " of " +
               std::to_string(figures_.total) + ")");
  caption_.Progress(figures_);
}
