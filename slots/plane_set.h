#pragma once

#include "base/failures.h"
#include "slots/slot_table.h"

#include <filesystem>
#include <string_view>

// Whether a subfolder's own name marks it as a plane-set folder: it starts with "P-" exactly.
bool IsPlaneSetName(std::string_view name);
// The plane-set folders directly inside a flight-model folder, in name order.
std::vector<std::filesystem::path> PlaneSetFolders(const std::filesystem::path &fmFolder);
// The slot-grid row of one plane-set folder, read from its first "*.zep" file in name order:
// line 1 the aircraft, line 2 the slot, lines 166 to 169 the character codes of the skin code
// (upper-cased; a code outside 0 to 255 adds nothing). Texts are the file's bytes. Without a
// readable description file the row holds only the folder's name.
SlotRow ReadPlaneSet(const std::filesystem::path &planeSetFolder, Failures &failures);
