#include "library/loaded_record.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/names.h"
#include "base/text_file.h"

#include <algorithm>
#include <unordered_set>

namespace fs = std::filesystem;

fs::path RecordPath(const LibraryState &state) {
  return FindAnyCase(state.LibDir, "FoldersLoaded.txt");
}

std::string RecordText(const FolderGrid &grid) {
  std::string text;
  // A folder listed under two categories of one letter has two rows, yet is loaded once.
  std::unordered_set<std::string> written;
  for (const GridRow &row : grid.rows)
    if (IsLoaded(row) && written.insert(row.name).second)
      text += row.name + "\r\n";
  return text + "\r\n";
}

void SaveLoaded(LibraryState &state, Failures &failures) {
  WriteAtomically(RecordPath(state), RecordText(state.Unigrid), failures);
}

std::vector<std::string> ReadLoadedNames(const LibraryState &state, Failures &failures) {
  std::vector<std::string> names;
  if (auto lines = ReadLinesIfExists(RecordPath(state), failures)) {
    for (std::string &line : *lines)
      if (!line.empty())
        names.push_back(std::move(line));
  }
  return names;
}

void SetRecorded(const LibraryState &state, const std::string &name, bool loaded,
                 Failures &failures) {
  std::vector<std::string> names = ReadLoadedNames(state, failures);
  const auto found = std::find(names.begin(), names.end(), name);
  if ((found != names.end()) == loaded)
    return;
  if (loaded)
    names.push_back(name);
  else
    names.erase(std::remove(names.begin(), names.end(), name), names.end());
  WriteAtomically(RecordPath(state), JoinCrLf(names) + "\r\n", failures);
}

void EnsureRecord(const LibraryState &state, Failures &failures) {
  if (!FileCheck(RecordPath(state)))
    WriteAtomically(RecordPath(state), "", failures);
}
