#pragma once

#include "app/failures.h"

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

// Splits text into lines; a line ends at CR LF, a lone CR or a lone LF.
std::vector<std::string> SplitLines(const std::string &bytes);
// The whole file as bytes, or nothing (with the reason in `failures`) when it cannot be read.
std::optional<std::string> ReadBytes(const std::filesystem::path &path, Failures &failures);
// The file's lines, or nothing (with the reason in `failures`) when it cannot be read.
std::optional<std::vector<std::string>> ReadLines(const std::filesystem::path &path,
                                                  Failures &failures);
// Each line followed by CR LF.
std::string JoinCrLf(const std::vector<std::string> &lines);
// Replaces `target` by `bytes` through a temporary file beside it and a rename, so that the file
// is always either the old or the new one. Returns false, with the reason, on failure.
bool WriteAtomically(const std::filesystem::path &target, const std::string &bytes,
                     Failures &failures);
// The temporary file beside `target` that a replacement is written to before it is renamed.
std::filesystem::path PartialPath(const std::filesystem::path &target);
// Removes what a failed replacement left, but never a folder that merely has the temporary name.
void RemovePartial(const std::filesystem::path &partial);
// The reason of the last failed C library call, for messages.
std::string LastErrorText();
