#include "library/grid_builder.h"

#include "base/names.h"
#include "library/keeping.h"

#include <map>

namespace fs = std::filesystem;

bool IsReservedFolder(std::string_view name) {
  const std::string upper = Upper(name);
  return upper == "AUTOSCRIPTS" || upper == "SKINFOLDER" || upper == "UNUSED" ||
         upper == Upper(kKeepingFolder);
}

void BuildFolderRows(FolderGrid &grid, const std::vector<std::string> &codes,
                     const std::vector<fs::path> &libraryFolders) {
  grid.ClearFolders();
  // Group the folders by first character once, so each category line costs only its own rows.
  std::map<char, std::vector<GridRow>> byLetter;
  for (const fs::path &folder : libraryFolders) {
    std::string name = NameText(folder);
    if (name.empty() || IsReservedFolder(name))
      continue;
    GridRow row;
    row.path = folder;
    row.name = std::move(name);
    byLetter[row.name[0]].push_back(std::move(row));
  }
  for (const std::string &code : codes) {
    if (code.empty())
      continue;
    const auto found = byLetter.find(code[0]);
    if (found != byLetter.end())
      grid.rows.insert(grid.rows.end(), found->second.begin(), found->second.end());
  }
}
