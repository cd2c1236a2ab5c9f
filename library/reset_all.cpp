#include "library/reset_all.h"

#include "app/existence.h"
#include "app/names.h"
#include "app/text_file.h"
#include "library/listing.h"
#include "library/loaded_record.h"

#include <system_error>

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
  const fs::path file = FindAnyCase(libDir, "CleanUp.ini");
  FileCheck(file);
  if (!FileFound)
    return kDefaultCleanUpPatterns;
  // An empty list would delete nothing and a blank one is surely a slip: keep the default.
  const auto lines = ReadLines(file, failures);
  if (!lines || lines->empty() || IsBlank(lines->front()))
    return kDefaultCleanUpPatterns;
  return lines->front();
}

std::vector<std::string> CleanUpNames(const AppState &state, Failures &failures) {
  std::vector<std::string> names;
  for (std::string &name : ListFiles(state.EAWDir, CleanUpPatterns(state.LibDir, failures)))
    if (!IsProtected(name))
      names.push_back(std::move(name));
  return names;
}

void DeleteFiles(const fs::path &folder, const std::vector<std::string> &names,
                 Failures &failures) {
  for (const std::string &name : names) {
    const fs::path file = Child(folder, name);
    std::error_code error;
    fs::remove(file, error);
    if (error)
      failures.Add(file, "cannot be deleted (" + error.message() + ")");
  }
}

void CleanUp(const AppState &state, Failures &failures) {
  DeleteFiles(state.EAWDir, CleanUpNames(state, failures), failures);
}

// The record is now empty, so no row may stay marked: a later click would write it back.
static void UnmarkAllRows(AppState &state) {
  for (size_t row = 1; row < state.Unigrid.rows.size(); ++row) {
    state.Unigrid.rows[row].mark.clear();
    state.Unigrid.rows[row].nameColour = state.GridBackColor;
  }
  state.Slots.frameVisible = false;
}

void Command1Click(AppState &state, Caption &caption, Failures &failures) {
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
