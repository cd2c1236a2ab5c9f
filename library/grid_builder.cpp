#include "library/grid_builder.h"

#include "base/names.h"
#include "library/keeping.h"

#include "base/text_encoding.h"

#include <unordered_map>

namespace fs = std::filesystem;

bool IsReservedFolder(std::string_view name) {
  // Only a name of a reserved one's length is folded: a large library has few such.
  static constexpr std::string_view kReserved[] = {"AUTOSCRIPTS", "SKINFOLDER", "UNUSED",
                                                   kKeepingFolder};
  for (const std::string_view reserved : kReserved)
    if (name.size() == reserved.size() && Upper(name) == Upper(reserved))
      return true;
  return false;
}

void BuildFolderRows(FolderGrid &grid, const std::vector<std::string> &codes,
                     const fs::path &library, std::vector<std::string> folderNames) {
  grid.ClearFolders();
  grid.library = library;
  // Group the folders by first character once, so each category line costs only its own rows.
  // Letters are characters, compared as the category file's letters are read. The groups hold
  // positions and the rows are made once, in place: a large library's names are not held twice.
  // The names come sorted, so a run of one ASCII first byte needs its group looked up once.
  std::unordered_map<std::string, std::vector<size_t>> byLetter;
  std::vector<size_t> *group = nullptr;
  int groupByte = -1;
  for (size_t i = 0; i < folderNames.size(); ++i) {
    const std::string &name = folderNames[i];
    if (name.empty() || IsReservedFolder(name))
      continue;
    const int first = static_cast<unsigned char>(name.front());
    if (first != groupByte || first >= 0x80) {
      group = &byLetter[FirstCharacterOf(name).text];
      groupByte = first;
    }
    group->push_back(i);
  }
  // A letter on two category lines shows its folders twice: only the last line takes the names.
  std::unordered_map<std::string, size_t> lastLine;
  size_t rowCount = grid.rows.size();
  for (size_t line = 0; line < codes.size(); ++line) {
    lastLine[codes[line]] = line;
    if (const auto grouped = byLetter.find(codes[line]); grouped != byLetter.end())
      rowCount += grouped->second.size();
  }
  grid.rows.reserve(rowCount);
  for (size_t line = 0; line < codes.size(); ++line) {
    const std::string &letter = codes[line];
    const auto grouped = byLetter.find(letter);
    if (letter.empty() || grouped == byLetter.end())
      continue;
    const bool last = line == lastLine[letter];
    for (const size_t i : grouped->second) {
      if (last)
        grid.rows.emplace_back(std::move(folderNames[i]));
      else
        grid.rows.emplace_back(folderNames[i]);
    }
  }
}
