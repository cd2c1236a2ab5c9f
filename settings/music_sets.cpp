#include "settings/music_sets.h"

#include "base/listing.h"
#include "base/names.h"
#include "base/plain_name.h"
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

std::string MusicSetProblem(std::string_view line) {
  // Windows finds "Set1 " and "Set1." as the folder "Set1": only what it keeps must be plain.
  const size_t kept = line.find_last_not_of(" .");
  if (kept != std::string_view::npos)
    line = line.substr(0, kept + 1);
  return PlainNameProblem(line);
}

bool IsMusicSetName(std::string_view line) {
  return MusicSetProblem(line).empty() && !IsReservedFolderName(line);
}

// Whether line `number` of Music.ini names a set; one that is no plain name is named in
// `failures`, a blank one is no name at all.
static bool IsSetLine(std::string_view line, const fs::path &file, size_t number,
                      Failures &failures) {
  if (line.find_first_not_of(" \t") == std::string_view::npos)
    return false;
  const std::string problem = MusicSetProblem(line);
  if (!problem.empty())
    RefuseLine(file, number, line, problem, failures);
  return problem.empty() && !IsReservedFolderName(line);
}

static std::set<std::string> FoldedFolderNames(const fs::path &folder) {
  std::set<std::string> names;
  for (const fs::path &path : ListFolders(folder))
    names.insert(FoldName(NameText(path)));
  return names;
}

MusicList FillMusicList(const fs::path &eawDir, Failures &failures) {
  MusicList list;
  const fs::path file = FindAnyCase(eawDir, "Music.ini");
  const std::optional<std::vector<std::string>> lines = ReadLinesIfExists(file, failures);
  if (!lines)
    return list;
  const std::set<std::string> folders = FoldedFolderNames(eawDir);
  // A folder is found the way the platform finds it: any letter case, and on Windows without
  // trailing blanks and dots.
  const auto hasFolder = [&](const std::string &name) {
    return folders.count(FoldName(StoredName(name))) > 0;
  };
  for (size_t at = 0; at < lines->size(); ++at) {
    const std::string &line = (*lines)[at];
    if (!IsSetLine(line, file, at + 1, failures))
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
