#include "settings/music_sets.h"

#include "base/listing.h"
#include "base/names.h"
#include "base/text_encoding.h"
#include "base/text_file.h"

#include <set>

namespace fs = std::filesystem;

bool IsReservedFolderName(std::string_view name) {
  const std::string folded = FoldName(StoredName(name));
  for (const char *reserved : {"ZEP128", "Savedata", "Music"})
    if (folded == FoldName(reserved))
      return true;
  return false;
}

bool IsMusicSetName(std::string_view line) {
  if (line == "." || line == ".." || line.find_first_of("\\/:") != std::string_view::npos)
    return false;
  return line.find_first_not_of(" \t") != std::string_view::npos && !IsReservedFolderName(line);
}

static std::set<std::string> FoldedFolderNames(const fs::path &folder) {
  std::set<std::string> names;
  for (const fs::path &path : ListFolders(folder))
    names.insert(FoldName(NameText(path)));
  return names;
}

MusicList FillMusicList(const fs::path &eawDir, Failures &failures) {
  MusicList list;
  const std::optional<std::vector<std::string>> lines =
      ReadLinesIfExists(FindAnyCase(eawDir, "Music.ini"), failures);
  if (!lines)
    return list;
  const std::set<std::string> folders = FoldedFolderNames(eawDir);
  // A folder is found the way the platform finds it: any letter case, and on Windows without
  // trailing blanks and dots.
  const auto hasFolder = [&](const std::string &name) {
    return folders.count(FoldName(StoredName(name))) > 0;
  };
  for (const std::string &line : *lines) {
    if (!IsMusicSetName(line))
      continue;
    // Names are bytes; a Music.ini written in Windows-1252 names UTF-8 folders as text.
    const std::string text = TextAsUtf8(line);
    const std::string name = hasFolder(line) ? line : (hasFolder(text) ? text : NameFromText(line));
    if (hasFolder(name))
      list.entries.push_back(name);
    else
      list.current = name;
  }
  return list;
}
