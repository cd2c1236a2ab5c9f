#include "bench/file_work.h"

#include "bench/bench_game.h"
#include "bench/paired_rounds.h"
#include "bench/quiet_selector.h"
#include "library/folder_grid.h"
#include "library/reset_all.h"
#include "ui/main_window.h"

#include <QApplication>
#include <QTableView>
#include <algorithm>
#include <clocale>
#include <locale.h>
#include <set>

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
// loaded, and the Selector that loads and unloads that folder by a click on its row. With
// `originals`, the game has its own file of each name the folder brings.
class LoadBench {
public:
  LoadBench(const fs::path &root, int gameFiles, const std::string &variant = "",
            bool originals = false)
      : game_(MakeGame(root, "game" + std::to_string(gameFiles) + variant, "Skins: S\r\n",
                       gameFiles - kAddonFiles)),
        copies_(MakeAddon(game_, "S-Bench", kAddonFiles)),
        quiet_(std::make_unique<QuietSelector>(game_.game)) {
    if (originals)
      for (const auto &copy : copies_)
        WriteBytes(copy.second, 1024);
    StopOnFailures(quiet_->selector.StartUp().failures);
  }

  void Click() { StopOnFailures(quiet_->selector.ClickRow(0).failures); }
  bool Loaded() const { return IsLoaded(quiet_->selector.State().Unigrid.Row(0)); }
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
  const fs::path &Game() const { return game_.game; }

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

// Where the baseline puts the game's originals aside.
fs::path AsideOf(const fs::path &target) {
  return target.parent_path() / "aside" / target.filename();
}

// The least work that keeps the game's files: each renamed aside, then the copy.
void CopiesKeepingOriginals(const Copies &copies) {
  std::error_code error;
  for (const auto &[source, target] : copies) {
    fs::rename(target, AsideOf(target), error);
    fs::copy_file(source, target, error);
  }
}

// The game's originals back in place, whichever side put them aside.
void RestoreOriginals(LoadBench &bench) {
  bench.Unload();
  std::error_code error;
  for (const auto &copy : bench.CopiesMade()) {
    fs::create_directory(AsideOf(copy.second).parent_path(), error);
    fs::rename(AsideOf(copy.second), copy.second, error);
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

void BenchLoadKeepingOriginals(const fs::path &root, int pairs) {
  LoadBench bench(root, kAddonFiles, "-originals", true);
  const Copies &copies = bench.CopiesMade();
  RestoreOriginals(bench);
  PrintResult("load 2,000 small files over as many game files / rename aside+copy",
              RunPairs(pairs, {[&] { RestoreOriginals(bench); }, [&] { bench.Click(); }},
                       {[&] { RestoreOriginals(bench); }, [&] { CopiesKeepingOriginals(copies); }}),
              1.1);
}

// The same load clicked in the real window (offscreen), which shows its progress, against the
// Selector whose caption only stores its text.
void BenchLoadInWindow(const fs::path &root, int pairs) {
  LoadBench bench(root, kAddonFiles, "-quiet");
  const LoadBench shown(root, kAddonFiles, "-window");
  MainWindow window(shown.Game());
  window.FormLoad();
  window.show();
  QApplication::processEvents();
  QTableView *grid = window.findChild<QTableView *>("Unigrid");
  const auto clickInWindow = [&] {
    emit grid->clicked(grid->model()->index(0, 0));
    QApplication::processEvents();
  };
  const fs::path firstCopy = shown.CopiesMade().front().second;
  const auto unloadInWindow = [&] {
    if (fs::exists(firstCopy))
      clickInWindow();
  };
  bench.Clear();
  PrintResult("load 2,000 small files in the window / Selector, silent caption",
              RunPairs(pairs, {unloadInWindow, clickInWindow},
                       {[&] { bench.Clear(); }, [&] { bench.Click(); }}),
              1.1);
  unloadInWindow();
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

std::string FoldAscii(std::string text) {
  for (char &c : text)
    c = static_cast<char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
  return text;
}

// One directory read that folds each name once and matches it against the patterns, folded once
// beforehand, in the C locale, where fnmatch compares bytes.
void FoldOnceAndUnlink(const fs::path &folder, const std::vector<std::string> &foldedPatterns) {
  const locale_t bytes = ::newlocale(LC_ALL_MASK, "C", nullptr);
  const locale_t before = ::uselocale(bytes);
  DIR *dir = ::opendir(folder.c_str());
  const int descriptor = dir ? ::dirfd(dir) : -1;
  while (const dirent *entry = dir ? ::readdir(dir) : nullptr) {
    if (entry->d_type != DT_REG)
      continue;
    const std::string name = FoldAscii(entry->d_name);
    for (const std::string &pattern : foldedPatterns)
      if (::fnmatch(pattern.c_str(), name.c_str(), 0) == 0) {
        ::unlinkat(descriptor, entry->d_name, 0);
        break;
      }
  }
  if (dir)
    ::closedir(dir);
  ::uselocale(before);
  ::freelocale(bytes);
}

std::set<std::string> NamesIn(const fs::path &folder) {
  std::set<std::string> names;
  std::error_code error;
  for (const auto &entry : fs::directory_iterator(folder, error))
    names.insert(entry.path().filename().string());
  return names;
}

// Stops the benchmark unless both sides, run once each, leave the same files in `folder`.
void CheckSameFilesLeft(const fs::path &folder, const Side &ours, const Side &baseline) {
  ours.prepare();
  ours.run();
  const std::set<std::string> oursLeft = NamesIn(folder);
  baseline.prepare();
  baseline.run();
  if (oursLeft != NamesIn(folder)) {
    std::fprintf(stderr, "Reset All and its baseline leave different files in %s\n",
                 folder.string().c_str());
    std::exit(1);
  }
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
  Failures failures = quiet.selector.StartUp().failures;
  const Side ours{addAddonFiles, [&] {
                    failures.Append(
                        quiet.selector.ResetAll(quiet.selector.ResetAllFiles(failures)).failures);
                  }};
  const std::vector<std::string> patterns = SplitPatterns(kDefaultCleanUpPatterns);
  std::vector<std::string> folded;
  for (const std::string &pattern : patterns)
    folded.push_back(FoldAscii(pattern));
  const Side plain{addAddonFiles, [&] { MatchAndUnlink(game.game, patterns); }};
  const Side foldOnce{addAddonFiles, [&] { FoldOnceAndUnlink(game.game, folded); }};
  CheckSameFilesLeft(game.game, ours, plain);
  CheckSameFilesLeft(game.game, ours, foldOnce);
  const std::string work = "Reset All, 2,000 of 20,000 files match";
  PrintResult(work + " / read+fold once+fnmatch (C locale)+unlink", RunPairs(pairs, ours, foldOnce),
              1.2);
  PrintResult(work + " / read+fnmatch casefold (" + std::setlocale(LC_CTYPE, nullptr) + ")+unlink",
              RunPairs(pairs, ours, plain), 0);
  PrintResult(work + " / removal loop",
              RunPairs(pairs, ours, {addAddonFiles, [&] { PlainRemovals(addonFiles); }}), 0);
  StopOnFailures(failures);
}

} // namespace

void BenchCloneLoad(const fs::path &root, int pairs) {
  constexpr int kBigFiles = 20;
  const BenchGame game = MakeGame(root, "clone", "Skins: S\r\n", 0);
  Copies copies;
  fs::create_directories(game.library / "S-Big");
  for (int i = 0; i < kBigFiles; ++i) {
    const std::string name = Numbered("big", i, ".dat");
    WriteBytes(game.library / "S-Big" / name, 50 << 20);
    copies.emplace_back(game.library / "S-Big" / name, game.game / name);
  }
  QuietSelector quiet(game.game);
  Failures failures = quiet.selector.StartUp().failures;
  const auto clear = [&] {
    if (IsLoaded(quiet.selector.State().Unigrid.Row(0)))
      failures.Append(quiet.selector.ClickRow(0).failures);
    PlainRemovals(copies);
  };
  PrintResult("load 20 x 50 MB, reflink file system / copy loop",
              RunPairs(pairs,
                       {clear, [&] { failures.Append(quiet.selector.ClickRow(0).failures); }},
                       {clear, [&] { PlainCopies(copies); }}),
              0.05);
  clear();
  StopOnFailures(failures);
}

void BenchFileWork(const fs::path &root, int pairs, const std::string &only) {
  const auto wanted = [&](const char *lines) { return only == "files" || only == lines; };
  if (wanted("window"))
    BenchLoadInWindow(root, pairs);
  if (wanted("loads"))
    BenchLoads(root, pairs);
  if (wanted("keeping"))
    BenchLoadKeepingOriginals(root, pairs);
  if (wanted("unloads"))
    BenchUnloads(root, pairs);
  if (wanted("reset"))
    BenchResetAll(root, pairs);
}
