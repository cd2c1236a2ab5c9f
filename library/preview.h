#pragma once

#include "library/library_state.h"

#include <filesystem>
#include <string>

// What the hover preview shows for one folder.
struct FolderPreview {
  std::string description;       // the lines of contents.txt, each followed by CR LF
  std::filesystem::path picture; // the folder's picture file; empty for none
};

// The pattern list of the files that can be a folder's picture, in the order they are looked for.
inline constexpr char kPicturePatterns[] = "mypic;skinpic;*.jpg;*.bmp;*.gif";

// The preview of add-on folder `folder`. A missing folder, or a contents.txt that cannot be read,
// gives an empty description and no picture; a contents.txt too large to read says so instead.
FolderPreview PreviewOf(const std::filesystem::path &folder);
// The preview of grid row `row`; a row outside the grid (the header is -1) gives an empty preview.
FolderPreview PreviewOfRow(const LibraryState &state, int row);
