#include "base/name_index.h"

#include "base/listing.h"
#include "base/name_sieve.h"
#include "base/names.h"

#include <algorithm>

// The upper case of an ASCII letter, as Upper makes it.
static size_t ToUpperByte(char c) {
  return static_cast<unsigned char>(c >= 'a' && c <= 'z' ? c - ('a' - 'A') : c);
}

NameIndex::NameIndex(const std::filesystem::path &folder, const std::vector<std::string> &wanted) {
  NameSieve sieve;
  for (const std::string &name : wanted)
    sieve.Add(byFolded_.try_emplace(FoldName(name)).first->first);
  ForEachFile(
      folder,
      [&](std::string &&name) {
        // An ASCII name folds to its upper case, of its own length: of a large folder, only
        // those that could equal a wanted name in length and first letter are folded.
        if (!name.empty() && !sieve.MayHold(name.size(), ToUpperByte(name.front())) &&
            IsAscii(name))
          return;
        const auto found = byFolded_.find(FoldName(name));
        if (found != byFolded_.end())
          found->second.push_back(std::move(name));
      },
      FileKinds::WithHidden);
  // Several files differing only in case are rare; in name order, the choice among them does not
  // depend on the file system's order.
  for (auto &[folded, names] : byFolded_)
    if (names.size() > 1)
      std::sort(names.begin(), names.end(),
                [](const std::string &a, const std::string &b) { return NameLess(a, b); });
}

const std::vector<std::string> &NameIndex::Matches(std::string_view name) const {
  static const std::vector<std::string> none;
  const auto found = byFolded_.find(FoldName(name));
  return found == byFolded_.end() ? none : found->second;
}

std::string NameIndex::TargetName(const std::string &name) const {
  const std::vector<std::string> &matches = Matches(name);
  if (matches.empty() || std::find(matches.begin(), matches.end(), name) != matches.end())
    return name;
  return matches.front();
}

void NameIndex::Add(const std::string &name) {
  std::vector<std::string> &names = byFolded_[FoldName(name)];
  if (std::find(names.begin(), names.end(), name) == names.end())
    names.push_back(name);
}

void NameIndex::Remove(const std::string &name) {
  const auto found = byFolded_.find(FoldName(name));
  if (found == byFolded_.end())
    return;
  std::vector<std::string> &names = found->second;
  names.erase(std::remove(names.begin(), names.end(), name), names.end());
}
