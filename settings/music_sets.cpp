#include "settings/music_sets.h"

#include "base/listing.h"
#include "base/names.h"
#include "base/text_file.h"

#include <set>

namespace fs = std::filesystem;

bool IsMusicSetName(std::string_view line) {
  if (line == "." || line == ".." || line.find_first_of("\\/:") != std::string_view::npos)
    return false;
  return line.find_first_not_of(" \t") != std::string_view::npos;
}

static std::set<std::string> FolderNamesUpper(const fs::path &folder) {
  std::set<std::string> names;
  for (const fs::path &path : ListFolders(folder))
    names.insert(Upper(NameText(path)));
  return names;
}

MusicList FillMusicList(const fs::path &eawDir, Failures &failures) {
  MusicList list;
  const std::optional<std::vector<std::string>> lines =
      ReadLinesIfExists(FindAnyCase(eawDir, "Music.ini"), failures);
  if (!lines)
    return list;
  const std::set<std::string> folders = FolderNamesUpper(eawDir);
  for (const std::string &name : *lines) {
    if (!IsMusicSetName(name))
      continue;
    if (folders.count(Upper(name)))
      list.entries.push_back(name);
    else
      list.current = name;
  }
  return list;
}
