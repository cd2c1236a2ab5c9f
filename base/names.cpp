#include "base/names.h"

#include <algorithm>
#include <system_error>

namespace fs = std::filesystem;

std::string NameText(const fs::path &path) {
#ifdef _WIN32
  const std::u8string text = path.filename().u8string();
  return std::string(text.begin(), text.end());
#else
  return path.filename().string();
#endif
}

fs::path Child(const fs::path &folder, std::string_view name) {
#ifdef _WIN32
  return folder / fs::u8path(name.begin(), name.end());
#else
  return folder / fs::path(std::string(name));
#endif
}

std::string DisplayPath(const fs::path &path) {
#ifdef _WIN32
  const std::u8string text = path.u8string();
  return std::string(text.begin(), text.end());
#else
  return path.string();
#endif
}

static char UpperChar(char c) { return (c >= 'a' && c <= 'z') ? static_cast<char>(c - 32) : c; }

std::string Upper(std::string_view text) {
  std::string out(text);
  std::transform(out.begin(), out.end(), out.begin(), UpperChar);
  return out;
}

bool EndsWith(std::string_view text, std::string_view tail) {
  return text.size() >= tail.size() && text.substr(text.size() - tail.size()) == tail;
}

bool StartsWith(std::string_view text, std::string_view head) {
  return text.substr(0, head.size()) == head;
}

bool NameLess(std::string_view a, std::string_view b) {
  const size_t n = std::min(a.size(), b.size());
  for (size_t i = 0; i < n; ++i) {
    const auto ua = static_cast<unsigned char>(UpperChar(a[i]));
    const auto ub = static_cast<unsigned char>(UpperChar(b[i]));
    if (ua != ub)
      return ua < ub;
  }
  if (a.size() != b.size())
    return a.size() < b.size();
  return a < b;
}

fs::path FindAnyCase(const fs::path &folder, std::string_view name) {
  const fs::path exact = Child(folder, name);
  std::error_code error;
  if (fs::exists(exact, error))
    return exact;
  const std::string wanted = Upper(name);
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    if (Upper(NameText(it->path())) == wanted)
      return it->path();
  }
  return exact;
}
