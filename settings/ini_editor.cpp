#include "settings/ini_editor.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/text_file.h"
#include "settings/eaw_ini.h"

#include <system_error>

namespace fs = std::filesystem;

std::string IniDisplayText(const fs::path &eawDir, Failures &failures) {
  const std::optional<std::vector<std::string>> lines =
      ReadLinesIfExists(IniPath(eawDir), failures);
  return lines ? JoinCrLf(*lines) : "";
}

// The text with every line end (CR LF, lone CR or lone LF, as an editor widget may give them)
// made CR LF; a last line without line end stays without.
static std::string WithCrLf(const std::string &text) {
  std::string out;
  for (size_t i = 0; i < text.size(); ++i) {
    if (text[i] == '\r' && i + 1 < text.size() && text[i + 1] == '\n')
      ++i;
    if (text[i] == '\r' || text[i] == '\n')
      out += "\r\n";
    else
      out += text[i];
  }
  return out;
}

static bool IsReadOnly(const fs::path &path) {
  std::error_code error;
  const fs::perms perms = fs::status(path, error).permissions();
  return !error && (perms & fs::perms::owner_write) == fs::perms::none;
}

bool IniEditorSave(const fs::path &eawDir, const std::string &text, Failures &failures) {
  const fs::path path = IniPath(eawDir);
  FileCheck(path);
  if (!FileFound)
    return false;
  if (IsReadOnly(path)) {
    failures.Add(path, "is read-only; it was not changed");
    return false;
  }
  return WriteAtomically(path, WithCrLf(text) + "\r\n", failures);
}
