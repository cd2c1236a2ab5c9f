#include "base/new_file.h"
#include "tests/test_folder.h"

#include <cstdlib>
#include <fstream>
#include <gtest/gtest.h>
#include <sstream>
#include <sys/stat.h>

namespace {

// Where the source of a copy lies, and which way the copy is then expected to take.
struct CopyPlace {
  const char *name;
  const char *sourceBase; // a folder, or an environment variable naming one; empty for the target's
  CopyWay way;
};

dev_t DeviceOf(const fs::path &path) {
  struct stat info {};
  return ::stat(path.c_str(), &info) == 0 ? info.st_dev : 0;
}

std::string ReadAll(const fs::path &path) {
  std::ostringstream bytes;
  bytes << std::ifstream(path, std::ios::binary).rdbuf();
  return bytes.str();
}

class CopyWays : public testing::TestWithParam<CopyPlace> {};

} // namespace

// Within one file system copy_file_range moves the bytes, cloning them where the file system
// shares blocks (scripts/bench_reflink.sh sets SELECTOR_CLONE_FOLDER to a folder on such a file
// system); from tmpfs to another file system the kernel refuses it and the copy falls back. Either
// way the copy is whole, tells its progress, and is a file of its own: writing it leaves the
// library's file as it was.
TEST_P(CopyWays, TheCopyIsWholeAndIndependentWhicheverWayItTakes) {
  TestFolder target;
  const char *named = std::getenv(GetParam().sourceBase);
  const fs::path base = named                    ? named
                        : *GetParam().sourceBase ? GetParam().sourceBase
                                                 : target.Path();
  if (!fs::is_directory(base))
    GTEST_SKIP() << "no such folder here: " << base;
  const bool fallback = GetParam().way == CopyWay::Fallback;
  if (fallback && DeviceOf(base) == DeviceOf(target.Path()))
    GTEST_SKIP() << base << " is on the temporary folder's file system";
  const std::string unique = std::to_string(::getpid());
  const fs::path source = base / ("copy-way-source-" + unique);
  const fs::path copy = (fallback ? target.Path() : base) / ("copy-way-copy-" + unique);
  const std::string bytes = std::string(9 << 20, 'a') + "end";
  std::ofstream(source, std::ios::binary) << bytes;
  std::uint64_t reports = 0;
  EXPECT_FALSE(CopyToNewFile(source, copy, [&](std::uint64_t) { ++reports; }));
  EXPECT_EQ(LastCopyWay(), GetParam().way);
  EXPECT_GE(reports, 2u);
  EXPECT_EQ(ReadAll(copy), bytes);
  std::fstream(copy, std::ios::binary | std::ios::in | std::ios::out) << "changed";
  EXPECT_EQ(ReadAll(source), bytes);
  EXPECT_TRUE(AlreadyExists(CopyToNewFile(source, copy)));
  EXPECT_EQ(ReadAll(copy).substr(0, 7), "changed");
  fs::remove(source);
  fs::remove(copy);
}

INSTANTIATE_TEST_SUITE_P(Places, CopyWays,
                         testing::Values(CopyPlace{"SameFileSystem", "", CopyWay::InKernel},
                                         CopyPlace{"FromTmpfs", "/dev/shm", CopyWay::Fallback},
                                         CopyPlace{"CloningFileSystem", "SELECTOR_CLONE_FOLDER",
                                                   CopyWay::InKernel}),
                         [](const auto &info) { return std::string(info.param.name); });
