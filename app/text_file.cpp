#include "app/text_file.h"

#include <cerrno>
#include <cstring>
#include <fstream>
#include <iterator>
#include <system_error>

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

std::optional<std::string> ReadBytes(const fs::path &path, Failures &failures) {
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

std::optional<std::vector<std::string>> ReadLines(const fs::path &path, Failures &failures) {
  std::optional<std::string> bytes = ReadBytes(path, failures);
  if (!bytes)
    return std::nullopt;
  return SplitLines(*bytes);
}

std::string JoinCrLf(const std::vector<std::string> &lines) {
  std::string text;
  for (const std::string &line : lines)
    text += line + "\r\n";
  return text;
}

static bool WriteWhole(const fs::path &path, const std::string &bytes) {
  std::ofstream out(path, std::ios::binary | std::ios::trunc);
  if (!out)
    return false;
  out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
  out.close();
  return !out.fail();
}

fs::path PartialPath(const fs::path &target) {
  fs::path partial = target;
  partial += ".partial";
  return partial;
}

void RemovePartial(const fs::path &partial) {
  std::error_code error;
  if (fs::is_regular_file(partial, error))
    fs::remove(partial, error);
}

bool WriteAtomically(const fs::path &target, const std::string &bytes, Failures &failures) {
  const fs::path temporary = PartialPath(target);
  errno = 0;
  if (!WriteWhole(temporary, bytes)) {
    failures.Add(target, "cannot be written (" + LastErrorText() + ")");
    RemovePartial(temporary);
    return false;
  }
  std::error_code error;
  fs::rename(temporary, target, error);
  if (error) {
    failures.Add(target, "cannot be replaced (" + error.message() + ")");
    RemovePartial(temporary);
    return false;
  }
  return true;
}
