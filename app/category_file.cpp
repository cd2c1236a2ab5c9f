#include "app/category_file.h"

#include "base/existence.h"
#include "base/file_ops.h"
#include "base/names.h"
#include "base/text_encoding.h"
#include "base/text_file.h"

namespace fs = std::filesystem;

static const char *const kDefaultLines[] = {
    "Versions of the EAW.exe: E",
    "Non-Career Complete Sets: W",
    "Scenarios(No FM/skin etc): s",
    "Campaign/Career full sets: C",
    "Singlemission/Targets: Q",
    "Flight- and Damagemodels: F",
    "Gunsights: O",
    "Bases: U",
    "Sky and Horizon Sets: H",
    "Cloudlayers: R",
    "Groundobject Sets: D",
    "Tree Sets: i",
    "Terrain Sets: T",
    "Game Sounds(multiselection): N",
    "Speech (multiselection): X",
    "Mainscreens: B",
    "Screen Sets: K",
    "Axis skins: g",
    "Allied skins: a",
    "Inflight map: M",
    "Skin Sets: S",
    "Graphics1 (multiselection): G",
    "Graphics2 (multiselection): Z",
    "Land Height(eaw16.hm): L",
    "Frontlines: J",
    "EAW.tm: V",
    "Convoy Files: c",
};

std::string DefaultCategoryText() {
  std::string text;
  for (const char *line : kDefaultLines)
    text += std::string(line) + "\r\n";
  return text;
}

fs::path CategoryPath(const fs::path &libDir) { return FindAnyCase(libDir, "zep.ini"); }

void EnsureCategoryFile(const fs::path &libDir, Failures &failures) {
  if (!FileCheck(CategoryPath(libDir)))
    WriteAtomically(CategoryPath(libDir), DefaultCategoryText(), failures);
}

Categories ParseCategories(const std::vector<std::string> &lines) {
  Categories categories;
  for (size_t i = 0; i < lines.size(); ++i) {
    const std::string &line = lines[i];
    const size_t colon = line.find(':');
    if (colon == std::string::npos || i >= kMaxCategories) {
      categories.skipped.push_back({static_cast<int>(i + 1), line});
      continue;
    }
    categories.descriptions.push_back(line.substr(0, colon));
    categories.codes.push_back(LastCharacterOf(line));
  }
  return categories;
}

Categories ReadCategories(const fs::path &libDir, Failures &failures) {
  std::optional<std::vector<std::string>> lines =
      ReadLines(CategoryPath(libDir), failures, Encoding::Text);
  return lines ? ParseCategories(*lines) : Categories{};
}

std::vector<std::string> SkippedLinesMessage(const std::vector<SkippedLine> &skipped) {
  std::vector<std::string> lines = {"These lines of the category file \"zep.ini\" were skipped (a "
                                    "line needs a colon, and at most 256 lines are read):"};
  lines.reserve(skipped.size() + 1);
  for (const SkippedLine &line : skipped)
    lines.push_back("line " + std::to_string(line.number) + ": " + line.text);
  return lines;
}

Categories LibraryCategories(const fs::path &libDir, Failures &failures) {
  return FileCheck(CategoryPath(libDir)) ? ReadCategories(libDir, failures) : DefaultCategories();
}

Categories DefaultCategories() { return ParseCategories(SplitLines(DefaultCategoryText())); }
