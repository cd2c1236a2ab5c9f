#include "library/grid_builder.h"

#include "base/names.h"
#include "library/keeping.h"

#include <array>
#include <iterator>

namespace fs = std::filesystem;

bool IsReservedFolder(std::string_view name) {
  const std::string upper = Upper(name);
  return upper == "AUTOSCRIPTS" || upper == "SKINFOLDER" || upper == "UNUSED" ||
         upper == Upper(kKeepingFolder);
}

void BuildFolderRows(FolderGrid &grid, const std::vector<std::string> &codes,
                     const fs::path &library, std::vector<std::string> folderNames) {
  grid.ClearFolders();
  grid.library = library;
  // Group the folders by first character once, so each category line costs only its own rows.
  std::array<std::vector<GridRow>, 256> byLetter;
  for (std::string &name : folderNames) {
    if (name.empty() || IsReservedFolder(name))
      continue;
    GridRow row;
    row.name = std::move(name);
    byLetter[static_cast<unsigned char>(row.name[0])].push_back(std::move(row));
  }
  // A letter on two category lines shows its folders twice: only the last line takes the rows.
  std::array<size_t, 256> lastLine{};
  for (size_t line = 0; line < codes.size(); ++line)
    if (!codes[line].empty())
      lastLine[static_cast<unsigned char>(codes[line][0])] = line;
  for (size_t line = 0; line < codes.size(); ++line) {
    if (codes[line].empty())
      continue;
    const auto letter = static_cast<unsigned char>(codes[line][0]);
    std::vector<GridRow> &rows = byLetter[letter];
    if (line == lastLine[letter])
      grid.rows.insert(grid.rows.end(), std::make_move_iterator(rows.begin()),
                       std::make_move_iterator(rows.end()));
    else
      grid.rows.insert(grid.rows.end(), rows.begin(), rows.end());
  }
}
