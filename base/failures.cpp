#include "base/failures.h"

#include "base/names.h"

void Failures::Add(const std::filesystem::path &path, const std::string &reason) {
  Add(DisplayPath(path) + ": " + reason);
}

void Failures::Add(const std::string &text) {
  if (seen_.insert(text).second)
    lines_.push_back(text);
}

void Failures::Append(const Failures &later) {
  for (const std::string &line : later.lines_)
    Add(line);
  if (!later.heading_.empty())
    heading_ = later.heading_;
}

std::string Failures::Message(const std::string &fallback) const {
  std::string text = HeadingOr(fallback);
  for (const std::string &line : lines_)
    text += "\n" + line;
  return text;
}
