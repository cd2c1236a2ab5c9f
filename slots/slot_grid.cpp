#include "slots/slot_grid.h"

#include "base/names.h"
#include "slots/plane_set.h"

namespace fs = std::filesystem;

void GridSet(SlotPanel &slots, std::uint32_t &GridBackColor, const fs::path &FMfolder,
             Failures &failures) {
  GridBackColor = slots.currentCellColour;
  const std::vector<fs::path> planeSets = PlaneSetFolders(FMfolder);
  if (planeSets.empty())
    return;
  slots.label = DisplayPath(FMfolder) + static_cast<char>(fs::path::preferred_separator);
  slots.columns = kSlotColumns;
  slots.rows.clear();
  slots.rows.reserve(planeSets.size());
  for (const fs::path &planeSet : planeSets)
    slots.rows.push_back(ReadPlaneSet(planeSet, failures));
  slots.gridVisible = true;
}
