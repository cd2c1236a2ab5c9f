#include "base/new_file.h"
#include "base/progress_meter.h"
#include "tests/test_folder.h"

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

TEST(Progress, ABigCopyIsToldChunkByChunkAndTheCaptionNoMoreOftenThanItAsks) {
  TestFolder folder;
  const std::uint64_t size = 9 << 20;
  folder.Write("big.dat", std::string(size, 'x'));
  std::vector<std::uint64_t> copied;
  EXPECT_FALSE(CopyToNewFile(folder.Path() / "big.dat", folder.Path() / "copy.dat",
                             [&](std::uint64_t bytes) { copied.push_back(bytes); }));
  EXPECT_EQ(folder.Read("copy.dat").size(), size);
#ifndef _WIN32
  // Windows reports the chunks of CopyFileEx; Wine, where this runs, does not call the routine.
  ASSERT_FALSE(copied.empty());
#endif
  for (size_t i = 0; i < copied.size(); ++i) {
    EXPECT_LT(copied[i], size);
    EXPECT_GT(copied[i], i == 0 ? 0 : copied[i - 1]);
  }

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
