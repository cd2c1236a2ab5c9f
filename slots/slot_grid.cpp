#include "slots/slot_grid.h"

#include "base/names.h"
#include "slots/plane_set.h"

#include <algorithm>

namespace fs = std::filesystem;

std::string SlotTitle(const std::string &folder, const std::vector<SlotRow> &rows) {
  std::vector<std::string> files;
  for (const SlotRow &row : rows)
    if (!row.file.empty() && std::find(files.begin(), files.end(), row.file) == files.end())
      files.push_back(row.file);
  std::string title = folder;
  for (size_t i = 0; i < files.size(); ++i)
    title += (i == 0 ? ": " : ", ") + files[i];
  return title;
}

void GridSet(SlotPanel &slots, const fs::path &FMfolder, Failures &failures) {
  slots.columns = kSlotColumns;
  const std::vector<fs::path> planeSets = PlaneSetFolders(FMfolder);
  slots.frameVisible = !planeSets.empty();
  if (planeSets.empty())
    return;
  slots.rows.clear();
  slots.rows.reserve(planeSets.size());
  for (const fs::path &planeSet : planeSets)
    slots.rows.push_back(ReadPlaneSet(planeSet, failures));
  slots.label = SlotTitle(NameText(FMfolder), slots.rows);
  slots.gridVisible = true;
}
