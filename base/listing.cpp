#include "base/listing.h"

#include "base/names.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <system_error>
#include <utility>

#ifdef _WIN32
#include <windows.h>
#else
#include <cerrno>
#include <dirent.h>
#include <sys/stat.h>
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

namespace {

// What a listing tells of one entry.
enum class Kind { File, HiddenFile, Folder, Other };

#ifdef _WIN32
// Calls `visit` with each entry's name and kind, from one search; hidden and system files are
// told apart, as they are no files to the game.
template <typename Visit> std::error_code ForEachEntry(const fs::path &folder, const Visit &visit) {
  WIN32_FIND_DATAW found;
  // The basic form leaves out the short names, and large fetches take fewer trips to the disk.
  const HANDLE search = FindFirstFileExW((folder / L"*").c_str(), FindExInfoBasic, &found,
                                         FindExSearchNameMatch, nullptr, FIND_FIRST_EX_LARGE_FETCH);
  if (search == INVALID_HANDLE_VALUE) {
    const DWORD error = GetLastError();
    // Only a drive's root can hold no entry at all, not even "." and "..".
    if (error == ERROR_FILE_NOT_FOUND)
      return {};
    return std::error_code(static_cast<int>(error), std::system_category());
  }
  do {
    const DWORD attributes = found.dwFileAttributes;
    const std::wstring_view name = found.cFileName;
    if (name == L"." || name == L"..")
      continue;
    const Kind kind = (attributes & FILE_ATTRIBUTE_DIRECTORY) ? Kind::Folder
                      : (attributes & (FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM))
                          ? Kind::HiddenFile
                          : Kind::File;
    visit(NameText(fs::path(found.cFileName)), kind);
  } while (FindNextFileW(search, &found));
  FindClose(search);
  return {};
}
#else
// The kind of an entry, following a link as the game would; the listing tells it without a
// status call for all but links.
Kind KindOf(int folder, const dirent &entry) {
  if (entry.d_type == DT_REG)
    return Kind::File;
  if (entry.d_type == DT_DIR)
    return Kind::Folder;
  if (entry.d_type != DT_LNK && entry.d_type != DT_UNKNOWN)
    return Kind::Other;
  struct stat info {};
  if (::fstatat(folder, entry.d_name, &info, 0) != 0)
    return Kind::Other;
  return S_ISREG(info.st_mode) ? Kind::File : S_ISDIR(info.st_mode) ? Kind::Folder : Kind::Other;
}

// Calls `visit` with each entry's name, valid during the call, and kind.
template <typename Visit> std::error_code ForEachEntry(const fs::path &folder, const Visit &visit) {
  DIR *listing = ::opendir(folder.c_str());
  if (!listing)
    return std::error_code(errno, std::generic_category());
  while (const dirent *entry = ::readdir(listing)) {
    const std::string_view name = entry->d_name;
    if (name != "." && name != "..")
      visit(name, KindOf(::dirfd(listing), *entry));
  }
  ::closedir(listing);
  return {};
}
#endif

// A name to sort: its upper-case form (see Upper) and where it is in the listing.
struct SortEntry {
  std::string_view key;
  size_t index;
};

// How many entries a bucket must hold to be split by its next byte rather than compared.
constexpr size_t kRadixMinimum = 64;

// The order of names: by key, then by the name's bytes.
struct EntryLess {
  const std::vector<std::string> &names;
  bool operator()(const SortEntry &a, const SortEntry &b) const {
    const int keyOrder = a.key.compare(b.key);
    return keyOrder != 0 ? keyOrder < 0 : names[a.index] < names[b.index];
  }
};

// The eight key bytes from `depth` on as one number that orders as they do; a key that ends
// sooner has zeros there, which come first, as no name holds a zero byte.
uint64_t KeyWord(std::string_view key, size_t depth) {
  unsigned char bytes[8] = {};
  std::memcpy(bytes, key.data() + depth, std::min<size_t>(sizeof bytes, key.size() - depth));
  uint64_t word = 0;
  for (const unsigned char byte : bytes)
    word = word << 8 | byte;
  return word;
}

// Sorts a few entries, whose keys agree on their first `depth` bytes, comparing the next eight
// bytes as one number and whole keys and names only on a tie.
void SortFew(SortEntry *entries, size_t count, size_t depth, const EntryLess &less) {
  std::array<std::pair<uint64_t, SortEntry>, kRadixMinimum> words;
  for (size_t i = 0; i < count; ++i)
    words[i] = {KeyWord(entries[i].key, depth), entries[i]};
  std::sort(words.begin(), words.begin() + static_cast<std::ptrdiff_t>(count),
            [&](const auto &a, const auto &b) {
              return a.first != b.first ? a.first < b.first : less(a.second, b.second);
            });
  for (size_t i = 0; i < count; ++i)
    entries[i] = words[i].second;
}

// Sorts `entries`, whose keys agree on their first `depth` bytes, by key and then by name: one
// pass per byte splits them into buckets, so that a large folder's names, which share long
// beginnings, are not compared from their first byte again and again.
void SortByKey(SortEntry *entries, size_t count, size_t depth, std::vector<SortEntry> &spare,
               const EntryLess &less) {
  if (count < kRadixMinimum) {
    SortFew(entries, count, depth, less);
    return;
  }
  // The bytes that all keys share need no pass of their own.
  const std::string_view first = entries[0].key;
  size_t shared = first.size();
  for (size_t i = 1; i < count && shared > depth; ++i) {
    const std::string_view key = entries[i].key;
    size_t at = depth;
    while (at < shared && at < key.size() && key[at] == first[at])
      ++at;
    shared = at;
  }
  depth = shared;
  // Bucket 0 holds the keys that end here; bucket 1 + b those whose next byte is b.
  const auto bucket = [depth](const SortEntry &entry) -> size_t {
    return entry.key.size() == depth ? 0 : 1 + static_cast<unsigned char>(entry.key[depth]);
  };
  std::array<size_t, 258> starts{};
  for (size_t i = 0; i < count; ++i)
    ++starts[bucket(entries[i]) + 1];
  for (size_t b = 1; b < starts.size(); ++b)
    starts[b] += starts[b - 1];
  spare.assign(entries, entries + count);
  std::array<size_t, 258> next = starts;
  for (const SortEntry &entry : spare)
    entries[next[bucket(entry)]++] = entry;
  // Keys that end here are equal: the names decide.
  std::sort(entries, entries + starts[1], less);
  for (size_t b = 1; b + 1 < starts.size(); ++b)
    if (starts[b + 1] - starts[b] > 1)
      SortByKey(entries + starts[b], starts[b + 1] - starts[b], depth + 1, spare, less);
}

// Sorts as NameLess does, with each name's upper-case form made once, in one buffer.
void SortNames(std::vector<std::string> &names) {
  std::string keys;
  size_t bytes = 0;
  for (const std::string &name : names)
    bytes += name.size();
  keys.reserve(bytes);
  for (const std::string &name : names)
    keys += name;
  // As Upper does, in place: one buffer for all the keys.
  for (char &c : keys)
    c = static_cast<char>(c - (static_cast<unsigned char>(c - 'a') < 26 ? 'a' - 'A' : 0));
  std::vector<SortEntry> order;
  order.reserve(names.size());
  size_t start = 0;
  for (size_t i = 0; i < names.size(); ++i) {
    order.push_back({std::string_view(keys).substr(start, names[i].size()), i});
    start += names[i].size();
  }
  std::vector<SortEntry> spare;
  SortByKey(order.data(), order.size(), 0, spare, EntryLess{names});
  std::vector<std::string> sorted;
  sorted.reserve(names.size());
  for (const SortEntry &entry : order)
    sorted.push_back(std::move(names[entry.index]));
  names.swap(sorted);
}

} // namespace

std::error_code ForEachFile(const fs::path &folder,
                            const std::function<void(std::string &&name)> &visit, FileKinds kinds) {
  return ForEachEntry(folder, [&](std::string_view name, Kind kind) {
    if (kind == Kind::File || (kind == Kind::HiddenFile && kinds == FileKinds::WithHidden))
      visit(std::string(name));
  });
}

FileListing ListFilesOrReason(const fs::path &folder, std::string_view patterns, FileKinds kinds) {
  FileListing listing;
  const PatternList wanted(patterns);
  listing.error = ForEachFile(
      folder,
      [&](std::string &&name) {
        if (wanted.Matches(name))
          listing.names.push_back(std::move(name));
      },
      kinds);
  SortNames(listing.names);
  return listing;
}

std::vector<std::string> ListFiles(const fs::path &folder, std::string_view patterns,
                                   FileKinds kinds) {
  return ListFilesOrReason(folder, patterns, kinds).names;
}

std::vector<std::string> ListFolderNames(const fs::path &folder) {
  std::vector<std::string> names;
  ForEachEntry(folder, [&](std::string_view name, Kind kind) {
    if (kind == Kind::Folder)
      names.emplace_back(name);
  });
  SortNames(names);
  return names;
}

std::vector<fs::path> ListFolders(const fs::path &folder) {
  const std::vector<std::string> names = ListFolderNames(folder);
  std::vector<fs::path> paths;
  paths.reserve(names.size());
  for (const std::string &name : names)
    paths.push_back(Child(folder, name));
  return paths;
}
