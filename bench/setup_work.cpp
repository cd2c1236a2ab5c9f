#include "bench/setup_work.h"

#include "bench/bench_game.h"
#include "bench/paired_rounds.h"
#include "bench/quiet_selector.h"
#include "ui/folder_files_dialog.h"

#include <QApplication>
#include <QDialog>
#include <QElapsedTimer>
#include <QWidget>
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <unordered_map>

namespace fs = std::filesystem;

namespace {

constexpr int kFolders = 20, kFilesEach = 100, kBigFolder = 5000;

void StopOnFailures(const Failures &failures) {
  if (failures.Empty())
    return;
  std::fprintf(stderr, "%s\n", failures.Message("The benchmark's own work failed:").c_str());
  std::exit(1);
}

// A sound folder (any number load at once) of `count` small files with names of its own.
std::string MakeFolder(const BenchGame &game, const std::string &name, int count) {
  fs::create_directories(game.library / name);
  for (int i = 0; i < count; ++i)
    WriteBytes(game.library / name / Numbered((name + "-").c_str(), i, i % 10 ? ".dat" : ".msn"),
               2048);
  return name;
}

// Two setups "A" and "B" of 20 folders each, and one folder of 5,000 files.
class SetupBench {
public:
  explicit SetupBench(const fs::path &root)
      : game_(MakeGame(root, "setups", "Sounds: N\r\n", 2000)), quiet_(game_.game) {
    for (const char *set : {"A", "B"})
      for (int k = 0; k < kFolders; ++k)
        sets_[set].push_back(
            MakeFolder(game_, "N-" + std::string(set) + std::to_string(k + 10), kFilesEach));
    MakeFolder(game_, "N-Big", kBigFolder);
    Failures failures = quiet_.selector.StartUp().failures;
    const FolderGrid &grid = quiet_.selector.State().Unigrid;
    for (int row = 0; row < grid.RowCount(); ++row)
      rows_[grid.Row(row).name] = row;
    for (const char *set : {"A", "B"}) {
      ClickAll(sets_[set]);
      failures.Append(quiet_.selector.SaveSetup(set).failures);
      ClickAll({sets_[set].rbegin(), sets_[set].rend()});
    }
    StopOnFailures(failures);
  }
  // Makes setup `set` the loaded one, untimed.
  void Ensure(const std::string &set) {
    Failures failures;
    if (quiet_.selector.LoadedFolderNames(failures) != sets_[set])
      failures.Append(quiet_.selector.SwitchToSetup(set).failures);
    StopOnFailures(failures);
  }
  void Switch(const std::string &set) {
    StopOnFailures(quiet_.selector.SwitchToSetup(set).failures);
  }
  // What a player would click: each folder of `from` off, the last loaded first, then `to` on.
  void OneByOne(const std::string &from, const std::string &to) {
    ClickAll({sets_[from].rbegin(), sets_[from].rend()});
    ClickAll(sets_[to]);
  }
  int BigRow() { return rows_.at("N-Big"); }
  Selector &TheSelector() { return quiet_.selector; }

private:
  void ClickAll(const std::vector<std::string> &names) {
    Failures failures;
    for (const std::string &name : names)
      failures.Append(quiet_.selector.ClickRow(rows_.at(name)).failures);
    StopOnFailures(failures);
  }

  BenchGame game_;
  QuietSelector quiet_;
  std::unordered_map<std::string, std::vector<std::string>> sets_;
  std::unordered_map<std::string, int> rows_;
};

// The median time from asking for a folder's files to the dialog shown.
void TimeFilesDialog(SetupBench &bench, int rounds) {
  QWidget parent;
  parent.show();
  std::vector<double> ms;
  for (int round = 0; round < rounds; ++round) {
    QElapsedTimer timer;
    timer.start();
    Failures failures;
    OpenFolderFilesDialog(&parent, bench.TheSelector().FolderFiles(bench.BigRow(), failures));
    QApplication::processEvents();
    ms.push_back(static_cast<double>(timer.nsecsElapsed()) / 1e6);
    StopOnFailures(failures);
    for (QDialog *dialog : parent.findChildren<QDialog *>())
      dialog->close();
    QApplication::processEvents();
  }
  std::sort(ms.begin(), ms.end());
  std::printf("%-58s %9.1f ms (median of %d; aim: well under 1,000 ms)\n",
              "files dialog of a folder of 5,000 files, opened", ms[ms.size() / 2], rounds);
  std::fflush(stdout);
}

} // namespace

void BenchSetups(const fs::path &root, int pairs) {
  SetupBench bench(root);
  const Side ours{[&] { bench.Ensure("A"); }, [&] { bench.Switch("B"); }};
  const Side clicks{[&] { bench.Ensure("A"); }, [&] { bench.OneByOne("A", "B"); }};
  PrintResult("switch between setups of 20 folders, 2,000 files / clicks",
              RunPairs(pairs, ours, clicks), 1.1);
  TimeFilesDialog(bench, pairs);
}
