#include "settings/eaw_ini.h"

#include "app/existence.h"
#include "app/names.h"
#include "app/text_file.h"
#include "settings/loose_number.h"

#include <system_error>

namespace fs = std::filesystem;

fs::path IniPath(const fs::path &eawDir) { return FindAnyCase(eawDir, "eaw.ini"); }

IniValues IniRead(const fs::path &eawDir, Failures &failures) {
  IniValues values;
  const fs::path path = IniPath(eawDir);
  FileCheck(path);
  if (!FileFound)
    return values;
  const std::optional<std::vector<std::string>> lines = ReadLines(path, failures);
  if (!lines)
    return values;
  for (const std::string &line : *lines)
    for (size_t k = 0; k < kIniKeys.size(); ++k)
      if (StartsWith(line, kIniKeys[k]))
        values[k] = LooseNumberText(std::string_view(line).substr(kIniKeys[k].size()));
  return values;
}

static std::string RewrittenLine(const std::string &line, const IniTexts &texts) {
  for (size_t k = 0; k < kIniKeys.size(); ++k)
    if (StartsWith(line, kIniKeys[k]))
      return std::string(kIniKeys[k]) + texts[k];
  return line;
}

std::string RewrittenIni(const std::vector<std::string> &lines, const IniTexts &texts) {
  std::string text;
  for (const std::string &line : lines)
    text += RewrittenLine(line, texts) + "\r\n";
  return text;
}

void inisave(const fs::path &eawDir, bool ready, const IniTexts &texts, Failures &failures) {
  if (!ready)
    return;
  const fs::path path = IniPath(eawDir);
  FileCheck(path);
  if (!FileFound)
    return;
  if (const std::optional<std::vector<std::string>> lines = ReadLines(path, failures))
    ReplaceIni(path, RewrittenIni(*lines, texts), failures);
}

bool ReplaceIni(const fs::path &path, const std::string &bytes, Failures &failures) {
  std::error_code error;
  const fs::perms before = fs::status(path, error).permissions();
  // Windows refuses to replace a read-only file.
  if (!error)
    fs::permissions(path, fs::perms::owner_write, fs::perm_options::add, error);
  if (error) {
    failures.Add(path, "cannot be made writable (" + error.message() + ")");
    return false;
  }
  const bool written = WriteAtomically(path, bytes, failures);
  fs::permissions(path, written ? before | fs::perms::owner_write : before, error);
  return written;
}
