#include "app/startup.h"

#include "base/existence.h"
#include "base/listing.h"
#include "base/names.h"
#include "library/grid_builder.h"

#include <system_error>

namespace fs = std::filesystem;

std::vector<SkippedLine> PrepareLibrary(SelectorState &state, Failures &failures) {
  if (!FolderCheck(state.LibDir)) {
    std::error_code error;
    fs::create_directory(state.LibDir, error);
    if (error)
      failures.Add(state.LibDir, "cannot be created (" + error.message() + ")");
  }
  state.List3 = {"Show ALL", "Show Selections"};
  EnsureCategoryFile(state.LibDir, failures);
  Categories categories = LibraryCategories(state.LibDir, failures);
  state.List3.insert(state.List3.end(), categories.descriptions.begin(),
                     categories.descriptions.end());
  state.Codes = std::move(categories.codes);
  return std::move(categories.skipped);
}

void BuildGrid(LibraryState &state, const std::vector<std::string> &codes) {
  BuildFolderRows(state.Unigrid, codes, state.LibDir, ListFolderNames(state.LibDir));
}

fs::path GamePicture(const fs::path &eawDir, const char *name) {
  const fs::path picture = FindAnyCase(eawDir, name);
  return FileCheck(picture) ? picture : fs::path();
}
