#include "app/startup.h"

#include "app/existence.h"
#include "library/grid_builder.h"
#include "library/listing.h"

#include <algorithm>
#include <system_error>

namespace fs = std::filesystem;

std::vector<SkippedLine> PrepareLibrary(AppState &state, Failures &failures) {
  FolderCheck(state.LibDir);
  if (!FolderFound) {
    std::error_code error;
    fs::create_directory(state.LibDir, error);
    if (error)
      failures.Add(state.LibDir, "cannot be created (" + error.message() + ")");
  }
  state.List3 = {"Show ALL", "Show Selections"};
  EnsureCategoryFile(state.LibDir, failures);
  FileCheck(CategoryPath(state.LibDir));
  Categories categories = FileFound ? ReadCategories(state.LibDir, failures) : DefaultCategories();
  state.List3.insert(state.List3.end(), categories.descriptions.begin(),
                     categories.descriptions.end());
  state.Codes = std::move(categories.codes);
  return std::move(categories.skipped);
}

void BuildGrid(AppState &state, Failures &failures) {
  FileCheck(CategoryPath(state.LibDir));
  const Categories categories =
      FileFound ? ReadCategories(state.LibDir, failures) : DefaultCategories();
  BuildFolderRows(state.Unigrid, categories.codes, ListFolders(state.LibDir));
}

int GridHeightTwips(int rowCount) { return kRowHeight * std::min(rowCount, 20) + 72; }
