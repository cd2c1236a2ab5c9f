#pragma once

#include "base/failures.h"

#include <cstddef>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// The setup that Reset All saves before it changes anything: switching to it undoes the reset.
inline constexpr char kBeforeResetAllSetup[] = "Before Reset All";
// More folders than a setup can sensibly list: no library holds that many, a damaged file may.
inline constexpr size_t kMaxSetupLines = 10000;

// The folder of the setups, "setups" in the keeping folder of the library `libDir`.
std::filesystem::path SetupsFolder(const std::filesystem::path &libDir);
// Why `name` cannot name a setup, whose file "<name>.txt" must be possible on Windows too; empty
// when it can.
std::string SetupNameProblem(std::string_view name);
// The names of the setups, in name order; files whose names could not name a setup are left out.
std::vector<std::string> SetupNames(const std::filesystem::path &libDir);
// Whether a setup of that name exists, in any letter case.
bool SetupExists(const std::filesystem::path &libDir, std::string_view name);
// The folder names setup `name` lists, in its order, blank lines skipped. Nothing, with the reason
// in `failures`, when it is missing, a link, larger than 1 MB, longer than kMaxSetupLines or holds
// a line that is not a plain folder name: such a file is never acted on.
std::optional<std::vector<std::string>> ReadSetup(const std::filesystem::path &libDir,
                                                  std::string_view name, Failures &failures);
// Saves `folders`, one a line, as setup `name`, replacing a setup of that name in any case,
// atomically. False, with the reason in `failures`, when the name is unusable or it cannot be
// written.
bool WriteSetup(const std::filesystem::path &libDir, std::string_view name,
                const std::vector<std::string> &folders, Failures &failures);
// Removes what an interrupted write of a setup left behind; nothing through a link.
void RemoveHalfWrittenSetups(const std::filesystem::path &libDir);
// Deletes setup `name`. False, with the reason, when there is none or it cannot be deleted.
bool RemoveSetup(const std::filesystem::path &libDir, std::string_view name, Failures &failures);
