#include "settings/eaw_ini.h"

#include "base/file_ops.h"
#include "base/names.h"
#include "base/text_file.h"
#include "settings/loose_number.h"

namespace fs = std::filesystem;

fs::path IniPath(const fs::path &eawDir) { return FindAnyCase(eawDir, "eaw.ini"); }

IniValues IniRead(const fs::path &eawDir, Failures &failures) {
  IniValues values;
  const std::optional<std::vector<std::string>> lines =
      ReadLinesIfExists(IniPath(eawDir), failures);
  if (!lines)
    return values;
  for (const std::string &line : *lines)
    for (size_t k = 0; k < kIniKeys.size(); ++k)
      if (line.starts_with(kIniKeys[k]))
        values[k] = LooseNumberText(std::string_view(line).substr(kIniKeys[k].size()));
  return values;
}

static std::string RewrittenLine(const std::string &line, const IniTexts &texts) {
  for (size_t k = 0; k < kIniKeys.size(); ++k)
    if (line.starts_with(kIniKeys[k]))
      return std::string(kIniKeys[k]) + texts[k];
  return line;
}

std::string RewrittenIni(const std::vector<std::string> &lines, const IniTexts &texts) {
  std::string text;
  for (const std::string &line : lines)
    text += RewrittenLine(line, texts) + "\r\n";
  return text;
}

// How many of the keys the file's lines hold.
static int KeysFound(const std::vector<std::string> &lines) {
  int found = 0;
  for (const std::string_view key : kIniKeys)
    for (const std::string &line : lines)
      if (line.starts_with(key)) {
        ++found;
        break;
      }
  return found;
}

int inisave(const fs::path &eawDir, const IniTexts &texts, Failures &failures) {
  const fs::path path = IniPath(eawDir);
  const std::optional<std::vector<std::string>> lines = ReadLinesIfExists(path, failures);
  if (!lines || !WriteAtomically(path, RewrittenIni(*lines, texts), failures))
    return -1;
  return KeysFound(*lines);
}
