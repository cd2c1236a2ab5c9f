// Measures the program's file work and start-up as ratios against plain baselines in paired
// rounds, on tmpfs when the machine has one and on the temporary folder's own file system.
// Usage: selector_bench [pairs [files | window | loads | keeping | unloads | reset | setups |
// startup | clone <folder>]]   (at least 3; 9 when not given; a word runs only those lines,
// "clone" only the load of big files in <folder>, which scripts/bench_reflink.sh mounts). It starts
// itself with
// "--show-window <game folder>" for each timed start-up.

#include "bench/file_work.h"
#include "bench/paired_rounds.h"
#include "bench/setup_work.h"
#include "bench/startup_work.h"

#include <QApplication>
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>
#include <sys/vfs.h>
#include <unistd.h>
#include <vector>

namespace fs = std::filesystem;

namespace {

constexpr long kTmpfsMagic = 0x01021994;

bool IsTmpfs(const fs::path &folder) {
  struct statfs info {};
  return ::statfs(folder.c_str(), &info) == 0 && info.f_type == kTmpfsMagic;
}

// The mount line of the file system holding `folder`, for the reader to see its options.
std::string MountOf(const fs::path &folder) {
  std::ifstream mounts("/proc/mounts");
  std::string line, best, bestPoint;
  const std::string path = fs::canonical(folder).string();
  while (std::getline(mounts, line)) {
    const size_t start = line.find(' ') + 1;
    const std::string point = line.substr(start, line.find(' ', start) - start);
    if (path.rfind(point, 0) == 0 && point.size() >= bestPoint.size()) {
      best = line;
      bestPoint = point;
    }
  }
  return best;
}

void DescribeMachine() {
  std::ifstream cpu("/proc/cpuinfo");
  std::string line;
  while (std::getline(cpu, line))
    if (line.rfind("model name", 0) == 0) {
      std::printf("CPU: %s, %ld cores\n", line.substr(line.find(':') + 2).c_str(),
                  ::sysconf(_SC_NPROCESSORS_ONLN));
      break;
    }
}

std::vector<fs::path> Roots() {
  std::vector<fs::path> roots;
  if (IsTmpfs("/dev/shm"))
    roots.push_back("/dev/shm");
  const fs::path temporary = fs::temp_directory_path();
  if (roots.empty() || !IsTmpfs(temporary))
    roots.push_back(temporary);
  return roots;
}

} // namespace

int main(int argc, char **argv) {
  setenv("QT_QPA_PLATFORM", "offscreen", 0);
  if (argc == 3 && std::string(argv[1]) == "--show-window")
    return ShowWindowAndEnd(argv[2], argc, argv);
  QApplication app(argc, argv);
  const int pairs = std::max(3, argc > 1 ? std::atoi(argv[1]) : 9);
  DescribeMachine();
  if (argc == 4 && std::string(argv[2]) == "clone") {
    const fs::path root = fs::path(argv[3]) / ("selector-bench-" + std::to_string(::getpid()));
    fs::create_directories(root);
    PrintHeading("== " + std::string(argv[3]) + " (" + MountOf(argv[3]) + "), " +
                 std::to_string(pairs) + " pairs ==");
    BenchCloneLoad(root, pairs);
    fs::remove_all(root);
    return 0;
  }
  for (const fs::path &base : Roots()) {
    const fs::path root = base / ("selector-bench-" + std::to_string(::getpid()));
    fs::create_directories(root);
    PrintHeading("== " + base.string() + " (" + MountOf(base) + "), " + std::to_string(pairs) +
                 " pairs ==");
    const std::string only = argc > 2 ? argv[2] : "";
    if (only != "setups" && only != "startup")
      BenchFileWork(root, pairs, only.empty() ? "files" : only);
    if (only.empty() || only == "setups")
      BenchSetups(root, pairs);
    if (only.empty() || only == "startup")
      BenchStartUp(root, pairs);
    fs::remove_all(root);
  }
  std::printf("load 20 x 50 MB, reflink file system / copy loop: not run here "
              "(scripts/bench_reflink.sh runs it, as root with loop devices)\n");
  return 0;
}
