#include "library/record_replay.h"

#include "base/name_sieve.h"
#include "base/text_encoding.h"
#include "library/loaded_record.h"
#include "slots/slot_grid.h"

#include <string_view>
#include <unordered_map>
#include <vector>

void ReplayRecord(LibraryState &state, Failures &failures) {
  ReplayRecord(state, ReadLoadedNames(state, failures), failures);
}

void ReplayRecord(LibraryState &state, const std::vector<std::string> &lines, Failures &failures) {
  FolderGrid &grid = state.Unigrid;
  // Index the recorded names, not the rows, and find their rows in one pass: a library of tens
  // of thousands of folders then costs no copy of its names, and hashes only those that the
  // sieve lets through. Each line is looked up as written and read as UTF-8.
  std::vector<std::string> converted; // the lines that are not UTF-8, read as Windows-1252
  converted.reserve(lines.size());
  std::vector<std::string_view> utf8Lines;
  std::unordered_map<std::string_view, size_t> keyOf;
  keyOf.reserve(2 * lines.size());
  NameSieve sieve;
  for (const std::string &line : lines) {
    utf8Lines.push_back(IsUtf8(line) ? line : converted.emplace_back(TextAsUtf8(line)));
    for (const std::string_view name : {std::string_view(line), utf8Lines.back()}) {
      keyOf.try_emplace(name, keyOf.size());
      sieve.Add(name);
    }
  }
  // The rows of each name, in grid order, as one list: key k's rows are rows[starts[k]] on.
  std::vector<std::pair<size_t, int>> found;
  for (int row = 0; row < grid.RowCount(); ++row) {
    const std::string &name = grid.Row(row).name;
    if (!sieve.MayHold(name))
      continue;
    if (const auto key = keyOf.find(name); key != keyOf.end())
      found.emplace_back(key->second, row);
  }
  std::vector<size_t> starts(keyOf.size() + 1, 0);
  for (const auto &[key, row] : found)
    ++starts[key + 1];
  for (size_t key = 1; key < starts.size(); ++key)
    starts[key] += starts[key - 1];
  std::vector<int> rows(found.size());
  std::vector<size_t> next(starts.begin(), starts.end() - 1);
  for (const auto &[key, row] : found)
    rows[next[key]++] = row;
  for (size_t at = 0; at < lines.size(); ++at) {
    // A record written in Windows-1252 names the folders that UTF-8 names differently.
    size_t key = keyOf[lines[at]];
    if (starts[key] == starts[key + 1])
      key = keyOf[utf8Lines[at]];
    for (size_t i = starts[key]; i < starts[key + 1]; ++i) {
      grid.MarkRow(rows[i], true);
      if (Letter(grid.Row(rows[i])) == kFlightModelLetter)
        GridSet(state.Slots, grid.PathOf(rows[i]), failures);
    }
  }
}
