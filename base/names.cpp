#include "base/names.h"

#include "base/text_encoding.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <system_error>

#ifdef _WIN32
#include <windows.h>
#else
#include <clocale>
#include <cwctype>
#include <locale.h>
#endif

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
  // One string and one parse: appending a path copies every component of the folder's.
  std::string text = folder.native();
  if (!text.empty() && text.back() != '/')
    text += '/';
  text += name;
  return fs::path(std::move(text));
#endif
}

std::string DisplayPath(const fs::path &path) {
#ifdef _WIN32
  // A path from Qt or a literal may use "/": the player sees Windows' own separator only.
  const std::u8string text = fs::path(path).make_preferred().u8string();
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

bool IsAscii(std::string_view text) {
  // Eight bytes at a time: a large folder's names are each checked.
  std::uint64_t bits = 0;
  size_t at = 0;
  for (std::uint64_t word; at + sizeof word <= text.size(); at += sizeof word) {
    std::memcpy(&word, text.data() + at, sizeof word);
    bits |= word;
  }
  for (; at < text.size(); ++at)
    bits |= static_cast<unsigned char>(text[at]);
  return (bits & 0x8080808080808080u) == 0;
}

#ifdef _WIN32
// The invariant upper case, which NTFS and the system's ordinal case-insensitive comparison
// (CompareStringOrdinal) use, whatever the user's language: a Turkish "i" stays an "I" there.
static std::string FoldNonAscii(std::string_view name) {
  const std::wstring wide = WideFromBytes(name, CP_UTF8);
  const int size = static_cast<int>(wide.size());
  std::wstring upper(wide.size(), L'\0');
  if (LCMapStringEx(LOCALE_NAME_INVARIANT, LCMAP_UPPERCASE, wide.data(), size, upper.data(), size,
                    nullptr, nullptr, 0) != size)
    return std::string(name);
  return BytesFromWide(upper, CP_UTF8);
}
#else
// Upper case of lower case is simple case folding, in upper case, for all but the Turkish dotted
// and dotless i, which fold to themselves.
static char32_t FoldCodePoint(char32_t c, locale_t utf8) {
  if (c == 0x130 || c == 0x131)
    return c;
  return static_cast<char32_t>(towupper_l(towlower_l(static_cast<wint_t>(c), utf8), utf8));
}

static std::string FoldNonAscii(std::string_view name) {
  static const locale_t utf8 = newlocale(LC_CTYPE_MASK, "C.UTF-8", locale_t{});
  if (!utf8)
    return Upper(name);
  std::string out;
  char32_t c = 0;
  for (size_t at = 0; at < name.size();) {
    if (NextCodePoint(name, at, c))
      AppendUtf8(out, FoldCodePoint(c, utf8));
    else
      out += name[at++];
  }
  return out;
}
#endif

std::string FoldName(std::string_view name) {
  return IsAscii(name) ? Upper(name) : FoldNonAscii(name);
}

std::string StoredName(std::string_view name) {
#ifdef _WIN32
  const size_t kept = name.find_last_not_of(" .");
  return std::string(name.substr(0, kept == std::string_view::npos ? 0 : kept + 1));
#else
  return std::string(name);
#endif
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

std::vector<fs::path> EntriesAnyCase(const fs::path &folder, std::string_view name) {
  std::vector<fs::path> entries;
  const std::string wanted = FoldName(name);
  std::error_code error;
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error))
    if (FoldName(NameText(it->path())) == wanted)
      entries.push_back(it->path());
  return entries;
}

fs::path FindAnyCase(const fs::path &folder, std::string_view name) {
  const fs::path exact = Child(folder, name);
  std::error_code error;
  if (fs::exists(exact, error))
    return exact;
  const std::string wanted = FoldName(name);
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    if (FoldName(NameText(it->path())) == wanted)
      return it->path();
  }
  return exact;
}
