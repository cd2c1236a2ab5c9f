// Times MoveIn and MoveOut against plain std::filesystem copies and removals of the same files
// and prints how many times slower the program's own operations are.

#include "base/caption.h"
#include "base/failures.h"
#include "library/library_state.h"
#include "library/move_in.h"
#include "library/move_out.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <map>
#include <string>
#include <unistd.h>
#include <vector>

namespace fs = std::filesystem;

namespace {

constexpr size_t kSmallSize = 2 * 1024;
constexpr size_t kLargeSize = 20 * 1024 * 1024;

// Keeps the text only; the benchmark measures file work, not drawing.
class StoredCaption : public Caption {
public:
  std::string Get() const override { return text_; }
  void Set(const std::string &text) override { text_ = text; }

private:
  std::string text_;
};

// One generated game folder with one add-on folder to load and unload.
struct Workload {
  std::string name;
  fs::path game;
  fs::path addon;
  std::vector<std::pair<fs::path, fs::path>> copies; // source and where loading puts it
};

void WriteFile(const fs::path &path, size_t size) {
  static const std::string block(1024 * 1024, 'z');
  std::ofstream out(path, std::ios::binary);
  for (size_t left = size; left > 0; left -= std::min(left, block.size()))
    out.write(block.data(), static_cast<std::streamsize>(std::min(left, block.size())));
}

// Zero-padded, so that name order (the order of loading) is also the order of creation.
std::string Numbered(const char *stem, int number) {
  char text[32];
  std::snprintf(text, sizeof text, "%s%05d", stem, number);
  return text;
}

// Every tenth small file is a mission, so that "Savedata" is used as well as the game folder.
Workload MakeWorkload(const fs::path &root, const std::string &name, int small, int large,
                      int gameFiles) {
  Workload work{name, root / name / "game", root / name / "game" / "ZEP128" / "S-Bench", {}};
  fs::create_directories(work.addon);
  fs::create_directories(work.game / "Savedata");
  for (int i = 0; i < gameFiles; ++i)
    WriteFile(work.game / (Numbered("own", i) + ".dat"), kSmallSize);
  for (int i = 0; i < small; ++i) {
    const std::string file = Numbered("small", i) + (i % 10 == 0 ? ".msn" : ".dat");
    WriteFile(work.addon / file, kSmallSize);
    work.copies.emplace_back(work.addon / file,
                             (i % 10 == 0 ? work.game / "Savedata" : work.game) / file);
  }
  for (int i = 0; i < large; ++i) {
    const std::string file = Numbered("large", i) + ".dat";
    WriteFile(work.addon / file, kLargeSize);
    work.copies.emplace_back(work.addon / file, work.game / file);
  }
  return work;
}

void RemoveCopies(const Workload &work) {
  std::error_code error;
  for (const auto &copy : work.copies)
    fs::remove(copy.second, error);
}

void PlainCopies(const Workload &work) {
  std::error_code error;
  for (const auto &copy : work.copies)
    fs::copy_file(copy.first, copy.second, fs::copy_options::overwrite_existing, error);
}

// The starting points of the timed work; the sync keeps the setup's writing out of the timing.
void Unloaded(const Workload &work) {
  RemoveCopies(work);
  ::sync();
}

void Loaded(const Workload &work) {
  PlainCopies(work);
  ::sync();
}

LibraryState ReadyState(const Workload &work) {
  LibraryState state = LibraryFor(work.game);
  state.Ready = true;
  return state;
}

void BenchPlainCopy(benchmark::State &bench, const Workload *work) {
  for (auto _ : bench) {
    bench.PauseTiming();
    Unloaded(*work);
    bench.ResumeTiming();
    PlainCopies(*work);
  }
}

void BenchMoveIn(benchmark::State &bench, const Workload *work) {
  LibraryState state = ReadyState(*work);
  StoredCaption caption;
  Failures failures;
  for (auto _ : bench) {
    bench.PauseTiming();
    Unloaded(*work);
    bench.ResumeTiming();
    MoveIn(state, work->addon, caption, failures);
  }
  if (!failures.Empty())
    bench.SkipWithError(failures.Message("MoveIn failed:").c_str());
}

void BenchPlainRemoval(benchmark::State &bench, const Workload *work) {
  for (auto _ : bench) {
    bench.PauseTiming();
    Loaded(*work);
    bench.ResumeTiming();
    RemoveCopies(*work);
  }
}

void BenchMoveOut(benchmark::State &bench, const Workload *work) {
  LibraryState state = ReadyState(*work);
  StoredCaption caption;
  Failures failures;
  for (auto _ : bench) {
    bench.PauseTiming();
    // Loaded by the program, so that the unload knows from its ledger what the load put where.
    Unloaded(*work);
    MoveIn(state, work->addon, caption, failures);
    ::sync();
    bench.ResumeTiming();
    MoveOut(state, work->addon, caption, failures);
  }
  if (!failures.Empty())
    bench.SkipWithError(failures.Message("MoveOut failed:").c_str());
}

// Prints the usual table and keeps each benchmark's median real time for the ratios.
class RatioReporter : public benchmark::ConsoleReporter {
public:
  void ReportRuns(const std::vector<Run> &runs) override {
    ConsoleReporter::ReportRuns(runs);
    for (const Run &run : runs)
      if (run.run_type == Run::RT_Aggregate && run.aggregate_name == "median")
        medians[run.run_name.function_name] = run.GetAdjustedRealTime();
  }
  std::map<std::string, double> medians;
};

void PrintRatio(const RatioReporter &reporter, const std::string &ours, const std::string &plain,
                double aim) {
  const auto a = reporter.medians.find(ours), b = reporter.medians.find(plain);
  if (a == reporter.medians.end() || b == reporter.medians.end() || b->second <= 0)
    return;
  const double ratio = a->second / b->second;
  std::printf("%-28s %6.3fx  (aim %.1fx) %s\n", (ours + " / " + plain).c_str(), ratio, aim,
              ratio <= aim ? "ok" : "ABOVE AIM");
}

} // namespace

int main(int argc, char **argv) {
  // The file system's speed drifts while the benchmark runs; interleaving the repetitions of all
  // benchmarks spreads that drift evenly over ours and the plain ones. Flags given win.
  std::vector<char *> args{argv[0], const_cast<char *>("--benchmark_enable_random_interleaving")};
  args.insert(args.end(), argv + 1, argv + argc);
  int count = static_cast<int>(args.size());
  benchmark::Initialize(&count, args.data());
  const fs::path root = fs::temp_directory_path() / ("move-bench-" + std::to_string(::getpid()));
  // "mixed" is the folder the aims are set for; "small" and "large" are its two halves apart;
  // "crowded" unloads 2,000 files from a game folder of 20,000.
  std::vector<Workload> works;
  works.push_back(MakeWorkload(root, "mixed", 2000, 20, 0));
  works.push_back(MakeWorkload(root, "small", 2000, 0, 0));
  works.push_back(MakeWorkload(root, "large", 0, 20, 0));
  works.push_back(MakeWorkload(root, "crowded", 2000, 0, 18000));
  for (const Workload &work : works) {
    for (auto [label, function] :
         {std::make_pair("PlainCopy", BenchPlainCopy), std::make_pair("MoveIn", BenchMoveIn),
          std::make_pair("PlainRemoval", BenchPlainRemoval),
          std::make_pair("MoveOut", BenchMoveOut)})
      benchmark::RegisterBenchmark((std::string(label) + "/" + work.name).c_str(), function, &work)
          ->Unit(benchmark::kMillisecond)
          ->UseRealTime()
          ->Repetitions(7)
          ->ReportAggregatesOnly(true);
  }
  RatioReporter reporter;
  benchmark::RunSpecifiedBenchmarks(&reporter);
  std::printf("\nMedian real time ratios:\n");
  for (const Workload &work : works) {
    PrintRatio(reporter, "MoveIn/" + work.name, "PlainCopy/" + work.name, 1.2);
    PrintRatio(reporter, "MoveOut/" + work.name, "PlainRemoval/" + work.name, 1.3);
  }
  std::error_code error;
  fs::remove_all(root, error);
  benchmark::Shutdown();
  return 0;
}
