#include "library/grid_builder.h"

#include "base/names.h"
#include "library/keeping.h"

#include "base/text_encoding.h"

#include <iterator>
#include <unordered_map>

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
  // Letters are characters, compared as the category file's letters are read.
  std::unordered_map<std::string, std::vector<GridRow>> byLetter;
  for (std::string &name : folderNames) {
    if (name.empty() || IsReservedFolder(name))
      continue;
    GridRow row;
    row.name = std::move(name);
    byLetter[FirstCharacterOf(row.name).text].push_back(std::move(row));
  }
  // A letter on two category lines shows its folders twice: only the last line takes the rows.
  std::unordered_map<std::string, size_t> lastLine;
  for (size_t line = 0; line < codes.size(); ++line)
    lastLine[codes[line]] = line;
  for (size_t line = 0; line < codes.size(); ++line) {
    const std::string &letter = codes[line];
    const auto grouped = byLetter.find(letter);
    if (letter.empty() || grouped == byLetter.end())
      continue;
    std::vector<GridRow> &rows = grouped->second;
    if (line == lastLine[letter])
      grid.rows.insert(grid.rows.end(), std::make_move_iterator(rows.begin()),
                       std::make_move_iterator(rows.end()));
    else
      grid.rows.insert(grid.rows.end(), rows.begin(), rows.end());
  }
}
