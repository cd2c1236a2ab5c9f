#pragma once

#include "base/failures.h"

#include <filesystem>
#include <string>
#include <vector>

// The whole of eaw.ini as the editor shows it: each line followed by CR LF. Empty when the file
// is missing or unreadable.
std::string IniDisplayText(const std::filesystem::path &eawDir, Failures &failures);
// Saves the editor's text as eaw.ini: the text with CR LF line ends, then one more CR LF. Writes
// only over an existing, writable eaw.ini; a read-only one is reported and left as it was.
// Returns whether the file was written; the caller then reads the settings again.
bool IniEditorSave(const std::filesystem::path &eawDir, const std::string &text,
                   Failures &failures);
// The keys (the text before "=") whose lines differ between two texts of eaw.ini, in the order
// they first appear: changed values, and keys that only one of them has.
std::vector<std::string> ChangedKeys(const std::string &before, const std::string &after);
