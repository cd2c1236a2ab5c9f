#pragma once

#include "base/failures.h"

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

// How a file's bytes are taken: as they are (settings written back byte for byte), or as text
// from Windows, which is UTF-8 when valid and otherwise Windows-1252, given as UTF-8.
enum class Encoding { Bytes, Text };

// The largest text file the program reads whole. The settings, the category file, the record,
// Music.ini, CleanUp.ini, descriptions and plane-set files are a few kilobytes; a larger one is
// damaged or not what it seems, and reading it would stall the program.
inline constexpr std::uintmax_t kMaxTextBytes = 1 << 20;

// Splits text into lines; a line ends at CR LF, a lone CR or a lone LF.
std::vector<std::string> SplitLines(const std::string &bytes);
// The whole file as bytes, or nothing (with the reason in `failures`) when it cannot be read or
// is larger than `maxBytes`.
std::optional<std::string> ReadBytes(const std::filesystem::path &path, Failures &failures,
                                     std::uintmax_t maxBytes = kMaxTextBytes);
// The file's lines, or nothing (with the reason in `failures`) when it cannot be read.
std::optional<std::vector<std::string>> ReadLines(const std::filesystem::path &path,
                                                  Failures &failures,
                                                  Encoding encoding = Encoding::Bytes,
                                                  std::uintmax_t maxBytes = kMaxTextBytes);
// The lines of an optional file: nothing, silently, when it is missing; nothing, with the reason
// in `failures`, when it exists but cannot be read.
std::optional<std::vector<std::string>> ReadLinesIfExists(const std::filesystem::path &path,
                                                          Failures &failures,
                                                          Encoding encoding = Encoding::Bytes,
                                                          std::uintmax_t maxBytes = kMaxTextBytes);
// Each line followed by CR LF.
std::string JoinCrLf(const std::vector<std::string> &lines);
// The reason of the last failed C library call, for messages.
std::string LastErrorText();
