#pragma once

#include "library/folder_grid.h"

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

// Whether a library folder name is reserved ("AUTOSCRIPTS", "SKINFOLDER", "UNUSED" and the
// program's own keeping folder, any case).
bool IsReservedFolder(std::string_view name);
// Replaces the grid's folder rows: for each category letter in file order, every folder of
// `folderNames` (the subfolders of `library`, in name order) whose name starts with that letter.
// The rule text stays.
void BuildFolderRows(FolderGrid &grid, const std::vector<std::string> &codes,
                     const std::filesystem::path &library, std::vector<std::string> folderNames);
