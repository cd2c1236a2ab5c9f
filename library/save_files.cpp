#include "library/save_files.h"

#include "base/file_ops.h"
#include "base/listing.h"
#include "base/name_index.h"
#include "base/names.h"
#include "base/progress_meter.h"
#include "library/game_places.h"

#include <system_error>

namespace fs = std::filesystem;

bool IsCampaignName(std::string_view name) {
  return name.starts_with("C ") || name.starts_with("C-");
}

bool IsCampaignFolder(const fs::path &folder) { return IsCampaignName(NameText(folder)); }

void CarrySaveFiles(const fs::path &eawDir, const fs::path &campaign, Caption &caption,
                    Failures &failures) {
  const fs::path savedata = PlaceFolder(eawDir, Place::Savedata);
  // One listing: each file is tried once, so a file that cannot be moved ends the work.
  const std::vector<std::string> saves = ListFiles(savedata, "*.sve");
  NameIndex campaignFiles(campaign, saves);
  ProgressMeter meter(caption, static_cast<int>(saves.size()));
  for (const std::string &name : saves) {
    meter.NextFile("Please wait- copying: :", name);
    const fs::path source = Child(savedata, name);
    const std::string target = campaignFiles.TargetName(name);
    if (!CopyReplacing(source, Child(campaign, target), failures))
      continue;
    campaignFiles.Add(target);
    RemoveFile(source, failures,
               "was copied to " + DisplayPath(campaign) + " but cannot be deleted");
  }
}

void RemoveHalfCarried(const fs::path &campaign) {
  for (const std::string &name : ListFiles(campaign, "*.sve.partial"))
    RemovePartial(Child(campaign, name));
}
