#include "bench/startup_work.h"

#include "bench/bench_game.h"
#include "bench/paired_rounds.h"
#include "ui/main_window.h"

#include <QApplication>
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <fstream>
#include <memory>
#include <spawn.h>
#include <string>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

extern char **environ;

namespace fs = std::filesystem;

namespace {

constexpr char kLetters[] = "CGNSX";
constexpr char kCategories[] =
    "Campaigns: C\r\nGround objects: G\r\nSounds: N\r\nSkins: S\r\nExtras: X\r\n";

// A library of `folders` add-on folders spread over five categories, the first `loaded` of the
// ones whose category allows several recorded as loaded.
BenchGame MakeLibrary(const fs::path &root, const std::string &name, int folders, int loaded) {
  const BenchGame game = MakeGame(root, name, kCategories, 0);
  std::ofstream record(game.library / "FoldersLoaded.txt", std::ios::binary);
  for (int i = 0; i < folders; ++i) {
    const char letter = kLetters[i % 5];
    const std::string folder = Numbered((std::string(1, letter) + "-Addon").c_str(), i, "");
    fs::create_directory(game.library / folder);
    WriteBytes(game.library / folder / "readme.txt", 100);
    if ((letter == 'G' || letter == 'N') && loaded-- > 0)
      record << folder << "\r\n";
  }
  record << "\r\n";
  return game;
}

std::unique_ptr<MainWindow> ShowWindow(const fs::path &game) {
  auto window = std::make_unique<MainWindow>(game);
  window->FormLoad();
  window->show();
  QApplication::processEvents();
  return window;
}

// Starts this program as the child that shows the window on `game`; returns the child's peak
// memory in MiB, as it tells it once the window is shown. (The peak that wait4 reports would also
// hold this process's size, which the child shares until it runs the program anew.)
double RunChild(const BenchGame &game) {
  const std::string self = fs::read_symlink("/proc/self/exe").string();
  const std::string folder = game.game.string();
  char *args[] = {const_cast<char *>(self.c_str()), const_cast<char *>("--show-window"),
                  const_cast<char *>(folder.c_str()), nullptr};
  int told[2];
  if (::pipe(told) != 0)
    return 0;
  // Qt's notes on the missing runtime folder of a headless machine would fill the table.
  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, "/dev/null", O_WRONLY, 0);
  posix_spawn_file_actions_adddup2(&actions, told[1], STDOUT_FILENO);
  posix_spawn_file_actions_addclose(&actions, told[0]);
  pid_t child = 0;
  const int spawned = posix_spawn(&child, self.c_str(), &actions, nullptr, args, environ);
  posix_spawn_file_actions_destroy(&actions);
  ::close(told[1]);
  std::string text;
  char buffer[256];
  for (ssize_t got; (got = ::read(told[0], buffer, sizeof buffer)) > 0;)
    text.append(buffer, static_cast<size_t>(got));
  ::close(told[0]);
  if (spawned != 0)
    return 0;
  int status = 0;
  ::waitpid(child, &status, 0);
  return std::atof(text.c_str()) / 1024.0;
}

// This process's peak resident size in KiB, from the kernel's high-water mark.
double PeakKiB() {
  std::ifstream status("/proc/self/status");
  std::string line;
  while (std::getline(status, line))
    if (line.rfind("VmHWM:", 0) == 0)
      return std::atof(line.c_str() + 6);
  return 0;
}

double Median(std::vector<double> values) {
  std::sort(values.begin(), values.end());
  return values[values.size() / 2];
}

} // namespace

int ShowWindowAndEnd(const fs::path &game, int argc, char **argv) {
  QApplication app(argc, argv);
  ShowWindow(game).release();
  std::printf("%.0f\n", PeakKiB());
  std::fflush(stdout);
  // What the player waits for ends here; tearing down is not part of it.
  ::_exit(0);
}

void BenchStartUp(const fs::path &root, int pairs) {
  const BenchGame empty = MakeLibrary(root, "empty-library", 0, 0);
  struct Size {
    int folders;
    const char *count;
    double aim, aimMiB;
  };
  std::unique_ptr<MainWindow> shown;
  for (const Size size : {Size{5000, "5,000", 1.3, 10}, Size{50000, "50,000", 1.5, 5}}) {
    const BenchGame big = MakeLibrary(root, "library" + std::to_string(size.folders), size.folders,
                                      size.folders / 10);
    std::vector<double> bigMiB, emptyMiB;
    const Side ours{[] {}, [&] { bigMiB.push_back(RunChild(big)); }};
    const Side plain{[] {}, [&] { emptyMiB.push_back(RunChild(empty)); }};
    const std::string folders = std::string(size.count) + " folders";
    PrintResult("start-up to the window shown, " + folders + " / empty library",
                RunPairs(pairs, ours, plain), size.aim);
    const double added = Median(bigMiB) - Median(emptyMiB);
    std::printf("%-58s %+8.2f MiB peak memory over an empty library  aim +%.0f MiB %s\n",
                ("start-up, " + folders).c_str(), added, size.aimMiB,
                added <= size.aimMiB ? "met" : "NOT MET");

    // The first window of a process loads fonts and styles: not part of either side.
    if (!shown)
      shown = ShowWindow(empty.game);
    const Side oursWindow{[&] { shown.reset(); }, [&] { shown = ShowWindow(big.game); }};
    const Side plainWindow{[&] { shown.reset(); }, [&] { shown = ShowWindow(empty.game); }};
    PrintResult("  of which the window alone, in a running program",
                RunPairs(pairs, oursWindow, plainWindow), 0);
  }
}
