#include "slots/plane_set.h"

#include "base/listing.h"
#include "base/names.h"
#include "base/text_file.h"
#include "slots/leading_number.h"

namespace fs = std::filesystem;

bool IsPlaneSetName(std::string_view name) { return name.starts_with("P-"); }

std::vector<fs::path> PlaneSetFolders(const fs::path &fmFolder) {
  std::vector<fs::path> found;
  for (fs::path &folder : ListFolders(fmFolder))
    if (IsPlaneSetName(NameText(folder)))
      found.push_back(std::move(folder));
  return found;
}

static std::string SkinCode(const std::vector<std::string> &lines) {
  constexpr size_t kFirstSkinLine = 166, kLastSkinLine = 169;
  std::string code;
  for (size_t line = kFirstSkinLine; line <= kLastSkinLine && line <= lines.size(); ++line) {
    const long long value = LeadingWholeNumber(lines[line - 1]);
    if (value >= 0 && value <= 255)
      code += static_cast<char>(static_cast<unsigned char>(value));
  }
  return Upper(code);
}

SlotRow ReadPlaneSet(const fs::path &planeSetFolder, Failures &failures) {
  SlotRow row;
  row.folder = NameText(planeSetFolder);
  const std::vector<std::string> descriptions = ListFiles(planeSetFolder, "*.zep");
  if (descriptions.empty())
    return row;
  row.file = descriptions.front();
  const auto lines = ReadLines(Child(planeSetFolder, descriptions.front()), failures);
  if (!lines)
    return row;
  if (lines->size() >= 1)
    row.aircraft = (*lines)[0];
  if (lines->size() >= 2)
    row.plnSlot = (*lines)[1];
  row.skinSlot = SkinCode(*lines);
  return row;
}
