#include "library/preview.h"

#include "base/failures.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/text_file.h"

namespace fs = std::filesystem;

static std::string Description(const fs::path &file) {
  std::error_code error;
  const std::uintmax_t size = fs::file_size(file, error);
  if (!error && size > kMaxTextBytes)
    return "This description is too large to show: " + std::to_string(size / 1024) +
           " KB, and a description has at most " + std::to_string(kMaxTextBytes / 1024) +
           " KB.\r\n";
  // A description is a courtesy: one that cannot be read otherwise just leaves the preview empty.
  Failures ignored;
  const auto lines = ReadLines(file, ignored, Encoding::Text);
  return lines ? JoinCrLf(*lines) : "";
}

FolderPreview PreviewOf(const fs::path &folder) {
  FolderPreview preview;
  // One listing serves both the description (any letter case) and the picture.
  const std::string patterns = std::string("contents.txt;") + kPicturePatterns;
  bool described = false;
  for (const std::string &name : ListFiles(folder, patterns)) {
    if (!described && Upper(name) == "CONTENTS.TXT") {
      preview.description = Description(Child(folder, name));
      described = true;
    } else if (preview.picture.empty() && MatchesPatternList(name, kPicturePatterns)) {
      preview.picture = Child(folder, name);
    }
  }
  return preview;
}

FolderPreview PreviewOfRow(const LibraryState &state, int row) {
  if (!state.Unigrid.IsFolderRow(row))
    return {};
  return PreviewOf(state.Unigrid.PathOf(row));
}
