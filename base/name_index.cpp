#include "base/name_index.h"

#include "base/listing.h"
#include "base/names.h"

#include <algorithm>

NameIndex::NameIndex(const std::filesystem::path &folder, const std::vector<std::string> &wanted) {
  for (const std::string &name : wanted)
    byFolded_.try_emplace(FoldName(name));
  ForEachFile(
      folder,
      [this](std::string &&name) {
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
