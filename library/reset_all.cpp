#include "library/reset_all.h"

#include "base/file_ops.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/text_file.h"
#include "library/loaded_record.h"

namespace fs = std::filesystem;

static bool IsBlank(const std::string &line) {
  return line.find_first_not_of(" \t") == std::string::npos;
}

// Files the game itself keeps in its folder, whatever the patterns say.
static bool IsProtected(const std::string &name) {
  const std::string upper = Upper(name);
  return upper == "DSG.ICO" || upper == "EXTRA.SPT" || upper == "CHATLINE.TXT" ||
         upper == "HOF.DAT";
}

std::string CleanUpPatterns(const fs::path &libDir, Failures &failures) {
  // An empty list would delete nothing and a blank one is surely a slip: keep the default.
  const auto lines =
      ReadLinesIfExists(FindAnyCase(libDir, "CleanUp.ini"), failures, Encoding::Text);
  if (!lines || lines->empty() || IsBlank(lines->front()))
    return kDefaultCleanUpPatterns;
  return lines->front();
}

std::vector<std::string> CleanUpNames(const LibraryState &state, Failures &failures) {
  std::vector<std::string> names;
  for (std::string &name : ListFiles(state.EAWDir, CleanUpPatterns(state.LibDir, failures)))
    if (!IsProtected(name))
      names.push_back(std::move(name));
  return names;
}

void DeleteFiles(const fs::path &folder, const std::vector<std::string> &names,
                 Failures &failures) {
  for (const std::string &name : names)
    RemoveFile(Child(folder, name), failures);
}

void CleanUp(const LibraryState &state, Failures &failures) {
  DeleteFiles(state.EAWDir, CleanUpNames(state, failures), failures);
}

// The record is now empty, so no row may stay marked: a later click would write it back.
static void UnmarkAllRows(LibraryState &state) {
  for (size_t row = 1; row < state.Unigrid.rows.size(); ++row) {
    state.Unigrid.rows[row].mark.clear();
    state.Unigrid.rows[row].nameColour = state.GridBackColor;
  }
  state.Slots.frameVisible = false;
}

void ResetAll(LibraryState &state, Caption &caption, Failures &failures) {
  {
    CaptionRestorer restorer(caption);
    state.Ready = true;
    caption.Set("Please wait... cleaning up");
    CleanUp(state, failures);
    WriteAtomically(RecordPath(state), "", failures);
  }
  UnmarkAllRows(state);
  state.Ready = true;
}
