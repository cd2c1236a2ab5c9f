#include "library/setups.h"

#include "base/file_ops.h"
#include "base/links.h"
#include "base/listing.h"
#include "base/names.h"
#include "base/plain_name.h"
#include "base/text_file.h"
#include "library/keeping.h"

#include <system_error>

namespace fs = std::filesystem;

namespace {

constexpr std::string_view kExtension = ".txt";
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

std::string FileName(std::string_view name) { return std::string(name) + std::string(kExtension); }

// The setup's file, found whatever its letter case; the usual spelling when there is none.
fs::path SetupPath(const fs::path &libDir, std::string_view name) {
  return FindAnyCase(SetupsFolder(libDir), FileName(name));
}

std::string Quoted(std::string_view text) { return "\"" + std::string(text) + "\""; }

// A linked keeping or setups folder could lead anywhere: setups are neither read nor written
// through it.
bool LinkedFolder(const fs::path &libDir, Failures &failures) {
  for (const fs::path &folder : {KeepingFolder(libDir), SetupsFolder(libDir)}) {
    if (IsLink(folder)) {
      RefuseLink(folder, "no setup was read or written", failures);
      return true;
    }
  }
  return false;
}

// A line as a hand-written file may give it: blanks and tabs at its end are no part of a name
// (Windows cannot keep them).
std::string Trimmed(const std::string &line) {
  const size_t end = line.find_last_not_of(" \t");
  return end == std::string::npos ? "" : line.substr(0, end + 1);
}

// The names of the lines, or nothing (each bad line in `failures`) when any is no plain name.
std::optional<std::vector<std::string>> FolderNames(const std::vector<std::string> &lines,
                                                    Failures &failures) {
  std::vector<std::string> names;
  bool plain = true;
  for (size_t at = 0; at < lines.size(); ++at) {
    std::string name = Trimmed(lines[at]);
    if (name.empty())
      continue;
    const std::string problem = PlainNameProblem(name);
    if (!problem.empty()) {
      failures.Add("line " + std::to_string(at + 1) + " is " + problem);
      plain = false;
    }
    names.push_back(std::move(name));
  }
  if (!plain)
    return std::nullopt;
  return names;
}

} // namespace

fs::path SetupsFolder(const fs::path &libDir) { return KeepingFolder(libDir) / "setups"; }

std::string SetupNameProblem(std::string_view name) {
  if (const std::string problem = PlainNameProblem(name); !problem.empty())
    return problem;
  if (name.find_first_of("<>\"|?*") != std::string_view::npos)
    return "a name Windows does not allow (it holds one of < > \" | ? *)";
  if (FileName(name).size() > 255)
    return "a name longer than 251 bytes";
  return {};
}

std::vector<std::string> SetupNames(const fs::path &libDir) {
  std::vector<std::string> names;
  if (IsLink(KeepingFolder(libDir)) || IsLink(SetupsFolder(libDir)))
    return names;
  for (const std::string &file : ListFiles(SetupsFolder(libDir), "*.txt")) {
    const std::string name = file.substr(0, file.size() - kExtension.size());
    if (SetupNameProblem(name).empty())
      names.push_back(name);
  }
  return names;
}

bool SetupExists(const fs::path &libDir, std::string_view name) {
  std::error_code error;
  return SetupNameProblem(name).empty() &&
         fs::exists(fs::symlink_status(SetupPath(libDir, name), error));
}

std::optional<std::vector<std::string>> ReadSetup(const fs::path &libDir, std::string_view name,
                                                  Failures &failures) {
  const size_t before = failures.Lines().size();
  const auto refuse = [&](const std::string &why) {
    failures.SetHeading("The setup " + Quoted(name) + " was not used: " + why);
    return std::nullopt;
  };
  if (const std::string problem = SetupNameProblem(name); !problem.empty())
    return refuse(problem + ".");
  if (LinkedFolder(libDir, failures))
    return refuse("its folder is a link.");
  const fs::path path = SetupPath(libDir, name);
  std::error_code error;
  const fs::file_status status = fs::symlink_status(path, error);
  if (!fs::is_regular_file(status) || IsLink(path))
    return refuse(IsLink(path) ? "it is a link, which the program does not follow."
                               : "it is not in " + DisplayPath(SetupsFolder(libDir)) + ".");
  std::optional<std::string> bytes = ReadBytes(path, failures);
  if (!bytes)
    return refuse("it cannot be read.");
  if (std::string_view(*bytes).starts_with(kByteOrderMark))
    bytes->erase(0, kByteOrderMark.size());
  const std::vector<std::string> lines = SplitLines(*bytes);
  if (lines.size() > kMaxSetupLines)
    return refuse("it has " + std::to_string(lines.size()) + " lines, more than the " +
                  std::to_string(kMaxSetupLines) + " folders a setup can sensibly list.");
  std::optional<std::vector<std::string>> names = FolderNames(lines, failures);
  if (!names || failures.Lines().size() > before)
    return refuse("it holds lines that are no folder names, so it was not acted on at all:");
  return names;
}

bool WriteSetup(const fs::path &libDir, std::string_view name,
                const std::vector<std::string> &folders, Failures &failures) {
  if (const std::string problem = SetupNameProblem(name); !problem.empty()) {
    failures.Add(Quoted(name) + " cannot name a setup: it is " + problem);
    return false;
  }
  if (LinkedFolder(libDir, failures))
    return false;
  std::error_code error;
  fs::create_directories(SetupsFolder(libDir), error);
  return WriteAtomically(SetupPath(libDir, name), JoinCrLf(folders), failures);
}

bool RemoveSetup(const fs::path &libDir, std::string_view name, Failures &failures) {
  if (LinkedFolder(libDir, failures))
    return false;
  if (!SetupExists(libDir, name)) {
    failures.Add("There is no setup " + Quoted(name) + " to delete.");
    return false;
  }
  return RemoveFile(SetupPath(libDir, name), failures);
}

void RemoveHalfWrittenSetups(const fs::path &libDir) {
  const fs::path folder = SetupsFolder(libDir);
  if (IsLink(KeepingFolder(libDir)) || IsLink(folder))
    return;
  for (const std::string &name : ListFiles(folder, "*.partial"))
    RemovePartial(Child(folder, name));
}
