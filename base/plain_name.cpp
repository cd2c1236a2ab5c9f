#include "base/plain_name.h"

#include "base/names.h"

#include <algorithm>
#include <array>

namespace {

// Windows opens a device for these names whatever their extension ("nul.txt" is NUL).
bool IsDeviceName(std::string_view name) {
  static constexpr std::array<std::string_view, 6> kDevices = {"CON", "PRN",    "AUX",
                                                               "NUL", "CONIN$", "CONOUT$"};
  const std::string stem = Upper(name.substr(0, name.find('.')));
  // Trailing blanks before the extension are dropped by Windows too ("nul .txt").
  const std::string_view trimmed(stem.data(), stem.find_last_not_of(' ') + 1);
  if (std::find(kDevices.begin(), kDevices.end(), trimmed) != kDevices.end()) {
    return true;
  }
  if (!trimmed.starts_with("COM") && !trimmed.starts_with("LPT"))
    return false;
  const std::string_view number = trimmed.substr(3);
  // Windows counts the superscript digits one to three ("COM¹") among the port numbers.
  return (number.size() == 1 && number[0] >= '1' && number[0] <= '9') || number == "\xC2\xB9" ||
         number == "\xC2\xB2" || number == "\xC2\xB3";
}

bool HasForbiddenByte(std::string_view name) {
  return std::any_of(name.begin(), name.end(), [](char c) {
    const auto byte = static_cast<unsigned char>(c);
    return byte < 0x20 || c == '/' || c == '\\' || c == ':';
  });
}

} // namespace

std::string PlainNameProblem(std::string_view name) {
  if (name.empty()) {
    return "an empty name";
  }
  if (name == "." || name == "..") {
    return "not a name but a step between folders";
  }
  if (name.size() > 255) {
    return "a name longer than 255 bytes";
  }
  if (HasForbiddenByte(name)) {
    return "a path, not a plain name (it holds a separator, a drive or a control character)";
  }
  if (name.back() == '.' || name.back() == ' ') {
    return "a name Windows cannot keep (it ends in a dot or blank)";
  }
  if (IsDeviceName(name)) {
    return "a name Windows reserves for a device";
  }
  return {};
}

// A name for a message: control bytes shown as "?", and a long one cut short.
static std::string Shown(std::string_view name) {
  std::string shown(name.substr(0, 80));
  std::replace_if(
      shown.begin(), shown.end(), [](char c) { return static_cast<unsigned char>(c) < 0x20; }, '?');
  return name.size() > shown.size() ? shown + "..." : shown;
}

void RefuseLine(const std::filesystem::path &file, size_t line, std::string_view name,
                const std::string &problem, Failures &failures) {
  failures.Add(file, "line " + std::to_string(line) + " was ignored: \"" + Shown(name) + "\" is " +
                         problem + ", so nothing was done for it");
}

bool AcceptPlainName(std::string_view name, const std::filesystem::path &file, size_t line,
                     Failures &failures) {
  const std::string problem = PlainNameProblem(name);
  if (!problem.empty())
    RefuseLine(file, line, name, problem, failures);
  return problem.empty();
}
