#include "base/text_file.h"

#include "base/existence.h"
#include "base/text_encoding.h"

#include <cerrno>
#include <cstring>
#include <fstream>
#include <iterator>

namespace fs = std::filesystem;

std::vector<std::string> SplitLines(const std::string &bytes) {
  std::vector<std::string> lines;
  std::string line;
  for (size_t i = 0; i < bytes.size(); ++i) {
    const char c = bytes[i];
    if (c == '\r' || c == '\n') {
      if (c == '\r' && i + 1 < bytes.size() && bytes[i + 1] == '\n')
        ++i;
      lines.push_back(std::move(line));
      line.clear();
    } else {
      line += c;
    }
  }
  if (!line.empty())
    lines.push_back(std::move(line));
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
  std::string bytes((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
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
