#include "base/text_file.h"

#include "base/existence.h"
#include "base/text_encoding.h"

#include <cerrno>
#include <cstring>
#include <fstream>

namespace fs = std::filesystem;

std::vector<std::string> SplitLines(const std::string &bytes) {
  std::vector<std::string> lines;
  // Each line is taken whole rather than byte by byte: a record of thousands of lines is read at
  // every start-up.
  const char *const end = bytes.data() + bytes.size();
  const char *start = bytes.data();
  while (start != end) {
    const char *stop = start;
    while (stop != end && *stop != '\r' && *stop != '\n')
      ++stop;
    lines.emplace_back(start, stop);
    if (stop == end)
      break;
    start = stop + (*stop == '\r' && stop + 1 != end && stop[1] == '\n' ? 2 : 1);
  }
  return lines;
}

std::string LastErrorText() { return errno ? std::strerror(errno) : "unknown error"; }

std::optional<std::string> ReadBytes(const fs::path &path, Failures &failures,
                                     std::uintmax_t maxBytes) {
  std::error_code error;
  const std::uintmax_t size = fs::file_size(path, error);
  if (!error && size > maxBytes) {
    failures.Add(path, "was not read: it is " + std::to_string(size / 1024) +
                           " KB, larger than the " + std::to_string(maxBytes / 1024) +
                           " KB such a file can sensibly be");
    return std::nullopt;
  }
  errno = 0;
  std::ifstream in(path, std::ios::binary);
  if (!in) {
    failures.Add(path, "cannot be read (" + LastErrorText() + ")");
    return std::nullopt;
  }
  // Read in blocks, not character by character; the size is only a hint, as the file may change.
  std::string bytes;
  constexpr size_t kBlock = 64 * 1024;
  size_t got = 0, wanted = error ? kBlock : static_cast<size_t>(size) + 1;
  do {
    bytes.resize(got + wanted);
    in.read(bytes.data() + got, static_cast<std::streamsize>(wanted));
    got += static_cast<size_t>(in.gcount());
    wanted = kBlock;
  } while (in);
  bytes.resize(got);
  if (in.bad()) {
    failures.Add(path, "cannot be read (" + LastErrorText() + ")");
    return std::nullopt;
  }
  return bytes;
}

std::optional<std::vector<std::string>> ReadLines(const fs::path &path, Failures &failures,
                                                  Encoding encoding, std::uintmax_t maxBytes) {
  std::optional<std::string> bytes = ReadBytes(path, failures, maxBytes);
  if (!bytes)
    return std::nullopt;
  return SplitLines(encoding == Encoding::Text ? TextAsUtf8(*bytes) : *bytes);
}

std::optional<std::vector<std::string>> ReadLinesIfExists(const fs::path &path, Failures &failures,
                                                          Encoding encoding,
                                                          std::uintmax_t maxBytes) {
  if (!FileCheck(path))
    return std::nullopt;
  return ReadLines(path, failures, encoding, maxBytes);
}

std::string JoinCrLf(const std::vector<std::string> &lines) {
  std::string text;
  for (const std::string &line : lines)
    text += line + "\r\n";
  return text;
}
