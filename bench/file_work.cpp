#include "bench/file_work.h"

#include "bench/bench_game.h"
#include "bench/paired_rounds.h"
#include "bench/quiet_selector.h"
#include "library/folder_grid.h"
#include "library/reset_all.h"

#include <cstdio>
#include <cstdlib>
#include <dirent.h>
#include <fnmatch.h>
#include <memory>
#include <string>
#include <unistd.h>
#include <vector>

namespace fs = std::filesystem;

namespace {

constexpr int kAddonFiles = 2000;

using Copies = std::vector<std::pair<fs::path, fs::path>>;

void StopOnFailures(const Failures &failures) {
  if (failures.Empty())
    return;
  std::fprintf(stderr, "%s\n", failures.Message("The benchmark's own work failed:").c_str());
  std::exit(1);
}

// A game folder of `gameFiles` files in all once its add-on folder of 2,000 small files is
// loaded, and the Selector that loads and unloads that folder by a click on its row.
class LoadBench {
public:
  LoadBench(const fs::path &root, int gameFiles)
      : game_(MakeGame(root, "game" + std::to_string(gameFiles), "Skins: S\r\n",
                       gameFiles - kAddonFiles)),
        copies_(MakeAddon(game_, "S-Bench", kAddonFiles)),
        quiet_(std::make_unique<QuietSelector>(game_.game)) {
    Failures failures;
    quiet_->selector.StartUp(failures);
    StopOnFailures(failures);
  }

  void Click() {
    Failures failures;
    quiet_->selector.ClickRow(1, failures);
    StopOnFailures(failures);
  }
  bool Loaded() const { return IsLoaded(quiet_->selector.State().Unigrid.Row(1)); }
  void Unload() {
    if (Loaded())
      Click();
  }
  void Load() {
    if (!Loaded())
      Click();
  }
  // No copy in the game folder, whoever made them.
  void Clear() {
    Unload();
    std::error_code error;
    for (const auto &copy : copies_)
      fs::remove(copy.second, error);
  }
  const Copies &CopiesMade() const { return copies_; }

private:
  BenchGame game_;
  Copies copies_;
  std::unique_ptr<QuietSelector> quiet_;
};

void PlainCopies(const Copies &copies) {
  std::error_code error;
  for (const auto &[source, target] : copies)
    fs::copy_file(source, target, fs::copy_options::overwrite_existing, error);
}

void CopiesThroughTemporaryNames(const Copies &copies) {
  std::error_code error;
  for (const auto &[source, target] : copies) {
    fs::path temporary = target;
    temporary += ".partial";
    fs::copy_file(source, temporary, error);
    fs::rename(temporary, target, error);
  }
}

void PlainRemovals(const Copies &copies) {
  std::error_code error;
  for (const auto &copy : copies)
    fs::remove(copy.second, error);
}

void BenchLoads(const fs::path &root, int pairs) {
  for (const int gameFiles : {kAddonFiles, 20000}) {
    LoadBench bench(root, gameFiles);
    const Copies &copies = bench.CopiesMade();
    const std::string work =
        "load 2,000 small files, game folder of " + std::to_string(gameFiles) + " files";
    const Side ours{[&] { bench.Clear(); }, [&] { bench.Click(); }};
    PrintResult(work + " / temp+rename",
                RunPairs(pairs, ours,
                         {[&] { bench.Clear(); }, [&] { CopiesThroughTemporaryNames(copies); }}),
                1.1);
    PrintResult(work + " / copy loop",
                RunPairs(pairs, ours, {[&] { bench.Clear(); }, [&] { PlainCopies(copies); }}),
                1.25);
  }
}

void BenchUnloads(const fs::path &root, int pairs) {
  for (const int gameFiles : {5000, 20000, 100000}) {
    LoadBench bench(root, gameFiles);
    const Copies &copies = bench.CopiesMade();
    const Side ours{[&] {
                      bench.Clear();
                      bench.Load();
                    },
                    [&] { bench.Click(); }};
    const Side plain{[&] {
                       bench.Clear();
                       PlainCopies(copies);
                     },
                     [&] { PlainRemovals(copies); }};
    PrintResult("unload 2,000 files, game folder of " + std::to_string(gameFiles) +
                    " / removal loop",
                RunPairs(pairs, ours, plain), 1.2);
  }
}

std::vector<std::string> SplitPatterns(const std::string &list) {
  std::vector<std::string> patterns;
  size_t start = 0;
  for (size_t end; (end = list.find(';', start)) != std::string::npos; start = end + 1)
    patterns.push_back(list.substr(start, end - start));
  patterns.push_back(list.substr(start));
  return patterns;
}

// One directory read that deletes every plain file matching a pattern, as a shell tool would.
void MatchAndUnlink(const fs::path &folder, const std::vector<std::string> &patterns) {
  DIR *dir = ::opendir(folder.c_str());
  if (!dir)
    return;
  const int descriptor = ::dirfd(dir);
  while (const dirent *entry = ::readdir(dir)) {
    if (entry->d_type != DT_REG)
      continue;
    for (const std::string &pattern : patterns)
      if (::fnmatch(pattern.c_str(), entry->d_name, FNM_CASEFOLD) == 0) {
        ::unlinkat(descriptor, entry->d_name, 0);
        break;
      }
  }
  ::closedir(dir);
}

void BenchResetAll(const fs::path &root, int pairs) {
  constexpr int kGameFiles = 20000, kMatching = 2000;
  const BenchGame game = MakeGame(root, "reset", "Skins: S\r\n", kGameFiles - kMatching);
  Copies addonFiles;
  for (int i = 0; i < kMatching; ++i)
    addonFiles.emplace_back(fs::path(), game.game / Numbered("addon", i, i % 2 ? ".dat" : ".TXT"));
  const auto addAddonFiles = [&] {
    for (const auto &file : addonFiles)
      WriteBytes(file.second, 2048);
  };
  QuietSelector quiet(game.game);
  Failures failures;
  quiet.selector.StartUp(failures);
  const Side ours{addAddonFiles, [&] {
                    quiet.selector.ResetAll(quiet.selector.ResetAllFiles(failures), failures);
                  }};
  const std::vector<std::string> patterns = SplitPatterns(kDefaultCleanUpPatterns);
  const Side plain{addAddonFiles, [&] { MatchAndUnlink(game.game, patterns); }};
  const std::string work = "Reset All, 2,000 of 20,000 files match";
  PrintResult(work + " / read+fnmatch+unlink", RunPairs(pairs, ours, plain), 1.2);
  PrintResult(work + " / removal loop",
              RunPairs(pairs, ours, {addAddonFiles, [&] { PlainRemovals(addonFiles); }}), 0);
  StopOnFailures(failures);
}

} // namespace

void BenchFileWork(const fs::path &root, int pairs) {
  BenchLoads(root, pairs);
  BenchUnloads(root, pairs);
  BenchResetAll(root, pairs);
}
