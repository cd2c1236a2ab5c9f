#include "library/setup_switch.h"

#include "base/text_encoding.h"
#include "library/grid_click.h"
#include "library/keeping.h"

#include <map>
#include <unordered_map>
#include <unordered_set>

namespace {

std::string Quoted(const std::string &text) { return "\"" + text + "\""; }

// The first row of each folder name, and the loaded row where one is loaded.
std::unordered_map<std::string, int> RowsByName(const FolderGrid &grid) {
  std::unordered_map<std::string, int> rows;
  for (int row = 0; row < grid.RowCount(); ++row) {
    const auto [at, added] = rows.try_emplace(grid.Row(row).name, row);
    if (!added && IsLoaded(grid.Row(row)) && !IsLoaded(grid.Row(at->second)))
      at->second = row;
  }
  return rows;
}

// The folders of the library among `folders`, each once; names of none go to `failures`. A name
// from a file written in Windows-1252 is found by its UTF-8 spelling too.
std::vector<std::string> LibraryFolders(const std::unordered_map<std::string, int> &rows,
                                        const std::vector<std::string> &folders,
                                        Failures &failures) {
  std::vector<std::string> found;
  std::unordered_set<std::string> seen;
  for (const std::string &line : folders) {
    const std::string name = rows.count(line) ? line : TextAsUtf8(line);
    if (!rows.count(name))
      failures.Add(Quoted(line) + " is not in the library, so it was not loaded");
    else if (seen.insert(name).second)
      found.push_back(name);
  }
  return found;
}

// Keeps the last folder of each letter that allows one loaded folder, and says which were left.
std::vector<std::string> OnePerLetter(const std::vector<std::string> &folders,
                                      std::vector<std::string> &notices) {
  std::map<char, std::vector<std::string>> byLetter;
  for (const std::string &name : folders)
    if (!AllowsSeveralLoaded(name.front()))
      byLetter[name.front()].push_back(name);
  std::unordered_set<std::string> left;
  for (const auto &[letter, names] : byLetter) {
    if (names.size() < 2)
      continue;
    std::string others;
    for (size_t i = 0; i + 1 < names.size(); ++i) {
      left.insert(names[i]);
      others += (others.empty() ? "" : ", ") + Quoted(names[i]);
    }
    notices.push_back("Only one folder of letter \"" + std::string(1, letter) +
                      "\" can be loaded: " + Quoted(names.back()) + " was loaded, not " + others +
                      ".");
  }
  std::vector<std::string> kept;
  for (const std::string &name : folders)
    if (!left.count(name))
      kept.push_back(name);
  return kept;
}

// How many loaded folders, in load order, already stand where `wanted` wants them.
size_t KeptPrefix(const std::vector<std::string> &loaded, const std::vector<std::string> &wanted) {
  const std::unordered_set<std::string> wantedSet(wanted.begin(), wanted.end());
  size_t kept = 0;
  for (const std::string &name : loaded) {
    if (!wantedSet.count(name))
      continue;
    if (kept == wanted.size() || wanted[kept] != name)
      break;
    ++kept;
  }
  return kept;
}

void Click(LibraryState &state, int row, const std::string &doing, Caption &caption,
           Failures &failures) {
  caption.Set("Please wait- " + doing + " " + Quoted(state.Unigrid.Row(row).name));
  library::ClickRow(state, row, caption, failures);
}

} // namespace

std::vector<std::string> LoadedInOrder(const LibraryState &state, Failures &failures) {
  const FolderGrid &grid = state.Unigrid;
  std::unordered_set<std::string> loaded;
  for (int row = 0; row < grid.RowCount(); ++row)
    if (IsLoaded(grid.Row(row)))
      loaded.insert(grid.Row(row).name);
  std::vector<std::string> order;
  const Ledger ledger = Ledger::Read(KeepingFolder(state.LibDir), failures);
  for (const LoadedFolder &folder : ledger.Folders())
    if (loaded.erase(folder.name))
      order.push_back(folder.name);
  for (int row = 0; row < grid.RowCount(); ++row)
    if (loaded.erase(grid.Row(row).name))
      order.push_back(grid.Row(row).name);
  return order;
}

SwitchResult SwitchToFolders(LibraryState &state, const std::vector<std::string> &folders,
                             Caption &caption, Failures &failures) {
  SwitchResult result;
  const CaptionRestorer restorer(caption);
  const std::unordered_map<std::string, int> rows = RowsByName(state.Unigrid);
  const std::vector<std::string> wanted =
      OnePerLetter(LibraryFolders(rows, folders, failures), result.notices);
  const std::vector<std::string> loaded = LoadedInOrder(state, failures);
  const size_t kept = KeptPrefix(loaded, wanted);
  const std::unordered_set<std::string> keep(wanted.begin(), wanted.begin() + kept);
  for (auto name = loaded.rbegin(); name != loaded.rend(); ++name) {
    if (keep.count(*name))
      continue;
    Click(state, rows.at(*name), "unloading", caption, failures);
    ++result.unloaded;
  }
  for (size_t at = kept; at < wanted.size(); ++at) {
    const int row = rows.at(wanted[at]);
    Click(state, row, "loading", caption, failures);
    result.loaded += IsLoaded(state.Unigrid.Row(row)) ? 1 : 0;
  }
  return result;
}
