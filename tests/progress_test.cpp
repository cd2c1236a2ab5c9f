#include "base/progress_meter.h"

#include <gtest/gtest.h>

namespace {

// A caption that counts how often it is told, at the pace a window asks for.
class CountingCaption : public StoredCaption {
public:
  void Progress(const ProgressFigures &figures) override {
    ++shown;
    last = figures;
  }
  int shown = 0;
  ProgressFigures last;
};

} // namespace

// The caption is told no more often than it asks, however fast the files go by.
TEST(Progress, TheCaptionIsToldNoMoreOftenThanItAsks) {
  CountingCaption caption;
  const auto start = std::chrono::steady_clock::now();
  {
    const std::string name = "a.dat";
    ProgressMeter meter(caption, 200000, 200000 * std::uint64_t{10});
    for (int file = 0; file < 200000; ++file) {
      meter.NextFile("Please wait- copying: :", name, 10);
      meter.Copied(5);
    }
  }
  const auto tenths = (std::chrono::steady_clock::now() - start) / caption.ProgressInterval();
  EXPECT_GE(caption.shown, 1);
  EXPECT_LE(caption.shown, tenths + 1);
  EXPECT_EQ(caption.Get().rfind("Please wait- copying: :a.dat (", 0), 0u);
  EXPECT_EQ(caption.last.total, 200000);
  EXPECT_EQ(caption.last.bytesTotal, 2000000u);
}
