#include "settings/ini_editor.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/text_file.h"
#include "settings/eaw_ini.h"

#include <algorithm>
#include <map>
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
  if (!FileCheck(path))
    return false;
  if (IsReadOnly(path)) {
    failures.Add(path, "is read-only; it was not changed");
    return false;
  }
  return WriteAtomically(path, WithCrLf(text) + "\r\n", failures);
}

// Each key's value in `text`; where a key is on several lines, its last.
static std::map<std::string, std::string> ValuesByKey(const std::string &text,
                                                      std::vector<std::string> &order) {
  std::map<std::string, std::string> values;
  for (const std::string &line : SplitLines(text)) {
    const size_t equals = line.find('=');
    const std::string key = line.substr(0, equals);
    if (key.empty())
      continue;
    if (values.count(key) == 0)
      order.push_back(key);
    values[key] = equals == std::string::npos ? "" : line.substr(equals);
  }
  return values;
}

std::vector<std::string> ChangedKeys(const std::string &before, const std::string &after) {
  std::vector<std::string> order;
  const auto old = ValuesByKey(before, order);
  const auto now = ValuesByKey(after, order);
  std::vector<std::string> changed;
  for (const std::string &key : order) {
    const auto was = old.find(key), is = now.find(key);
    const bool differs = (was == old.end()) != (is == now.end()) ||
                         (was != old.end() && is != now.end() && was->second != is->second);
    if (differs && std::find(changed.begin(), changed.end(), key) == changed.end())
      changed.push_back(key);
  }
  return changed;
}
