#include "base/listing.h"

#include "base/names.h"

#include <algorithm>
#include <system_error>

#ifdef _WIN32
#include <windows.h>
#endif

namespace fs = std::filesystem;

// Where the UTF-8 character that starts at `at` ends: "?" stands for one character, not a byte.
static size_t CharacterEnd(std::string_view name, size_t at) {
  ++at;
  while (at < name.size() && (static_cast<unsigned char>(name[at]) & 0xC0) == 0x80)
    ++at;
  return at;
}

static bool MatchFrom(std::string_view name, std::string_view pattern) {
  size_t n = 0, p = 0, starP = std::string_view::npos, starN = 0;
  while (n < name.size()) {
    if (p < pattern.size() && pattern[p] == '*') {
      starP = p++;
      starN = n;
    } else if (p < pattern.size() && pattern[p] == '?') {
      ++p;
      n = CharacterEnd(name, n);
    } else if (p < pattern.size() && pattern[p] == name[n]) {
      ++p;
      ++n;
    } else if (starP != std::string_view::npos) {
      p = starP + 1;
      n = ++starN;
    } else {
      return false;
    }
  }
  while (p < pattern.size() && pattern[p] == '*')
    ++p;
  return p == pattern.size();
}

bool MatchesPattern(std::string_view name, std::string_view pattern) {
  if (pattern == "*.*")
    return true;
  return MatchFrom(FoldName(name), FoldName(pattern));
}

namespace {

// A ";"-separated pattern list with each pattern folded once, so that matching many names folds
// each name once and no pattern again.
class PatternList {
public:
  explicit PatternList(std::string_view patterns) {
    size_t start = 0;
    while (start <= patterns.size()) {
      size_t end = patterns.find(';', start);
      if (end == std::string_view::npos)
        end = patterns.size();
      const std::string_view pattern = patterns.substr(start, end - start);
      if (pattern == "*.*")
        everything_ = true;
      else if (!pattern.empty())
        folded_.push_back(FoldName(pattern));
      start = end + 1;
    }
  }
  bool Matches(std::string_view name) const {
    if (everything_)
      return true;
    if (folded_.empty())
      return false;
    const std::string folded = FoldName(name);
    return std::any_of(folded_.begin(), folded_.end(),
                       [&](const std::string &pattern) { return MatchFrom(folded, pattern); });
  }

private:
  std::vector<std::string> folded_;
  bool everything_ = false;
};

} // namespace

bool MatchesPatternList(std::string_view name, std::string_view patterns) {
  return PatternList(patterns).Matches(name);
}

static bool IsListedFile(const fs::directory_entry &entry) {
  std::error_code error;
  if (!entry.is_regular_file(error))
    return false;
#ifdef _WIN32
  const DWORD attributes = GetFileAttributesW(entry.path().c_str());
  if (attributes != INVALID_FILE_ATTRIBUTES &&
      (attributes & (FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM)))
    return false;
#endif
  return true;
}

std::vector<std::string> ListFiles(const fs::path &folder, std::string_view patterns) {
  std::vector<std::string> names;
  const PatternList wanted(patterns);
  std::error_code error;
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    if (!IsListedFile(*it))
      continue;
    std::string name = NameText(it->path());
    if (wanted.Matches(name))
      names.push_back(std::move(name));
  }
  std::sort(names.begin(), names.end(),
            [](const std::string &a, const std::string &b) { return NameLess(a, b); });
  return names;
}

std::vector<fs::path> ListFolders(const fs::path &folder) {
  std::vector<std::pair<std::string, fs::path>> found;
  std::error_code error;
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    std::error_code kindError;
    if (it->is_directory(kindError))
      found.emplace_back(NameText(it->path()), it->path());
  }
  std::sort(found.begin(), found.end(),
            [](const auto &a, const auto &b) { return NameLess(a.first, b.first); });
  std::vector<fs::path> paths;
  paths.reserve(found.size());
  for (auto &entry : found)
    paths.push_back(std::move(entry.second));
  return paths;
}
