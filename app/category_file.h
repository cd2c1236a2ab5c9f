#pragma once

#include "base/failures.h"

#include <filesystem>
#include <string>
#include <vector>

// At most this many category lines are read.
inline constexpr int kMaxCategories = 256;

// A category line the program could not use.
struct SkippedLine {
  int number; // from 1
  std::string text;
};

// The categories read from "zep.ini": descriptions for the category list, letters for `Codes`.
struct Categories {
  std::vector<std::string> descriptions;
  std::vector<std::string> codes;
  std::vector<SkippedLine> skipped;
};

// The 27 default lines, each ended by CR LF, byte for byte.
std::string DefaultCategoryText();
// The category file "zep.ini" of the library folder.
std::filesystem::path CategoryPath(const std::filesystem::path &libDir);
// Writes the default category file when it is missing.
void EnsureCategoryFile(const std::filesystem::path &libDir, Failures &failures);
// Categories from the file's lines: a line without a colon and lines past the 256th are skipped.
Categories ParseCategories(const std::vector<std::string> &lines);
// The categories of the default file, for a library where it could not be written.
Categories DefaultCategories();
// Reads the category file; an unreadable file gives no categories.
Categories ReadCategories(const std::filesystem::path &libDir, Failures &failures);
// The categories of the library: those of its category file, or the default ones when the file
// is missing (it could not be written).
Categories LibraryCategories(const std::filesystem::path &libDir, Failures &failures);
// The message that names the skipped lines: a line that says what they are, then one per line,
// so that a long list is shown as any long list of failures.
std::vector<std::string> SkippedLinesMessage(const std::vector<SkippedLine> &skipped);
