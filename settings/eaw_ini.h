#pragma once

#include "base/failures.h"

#include <array>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// How many settings the boxes show.
inline constexpr size_t kSettingCount = 6;
// The settings keys, in the order in which they are read and written: the boxes Width, Height,
// Extra Squads, Day, Month and Planeset.
inline constexpr std::array<std::string_view, kSettingCount> kIniKeys = {
    "Width=", "Height=", "ExtraSquads=", "Day=", "Month=", "PlaneSetNumber="};

// One text per key of kIniKeys, as the boxes hold them.
using IniTexts = std::array<std::string, kSettingCount>;
// One display text per key of kIniKeys; nothing where the key was not found.
using IniValues = std::array<std::optional<std::string>, kSettingCount>;

// The game's settings file "eaw.ini" in `eawDir`, found whatever its letter case.
std::filesystem::path IniPath(const std::filesystem::path &eawDir);
// The values of the six keys as the boxes show them, each from the key's last line. A missing
// or unreadable file gives nothing for every key, so that the boxes keep what they show.
IniValues IniRead(const std::filesystem::path &eawDir, Failures &failures);
// The file's lines with every line that begins with a key replaced by the key and its box text,
// each line ended by CR LF.
std::string RewrittenIni(const std::vector<std::string> &lines, const IniTexts &texts);
// Writes the six box texts into eaw.ini (Enter in a settings box). Does nothing when the file is
// missing; a read-only file is written and left writable. Returns how many of the keys the file
// holds, or -1 when it was not written.
int inisave(const std::filesystem::path &eawDir, const IniTexts &texts, Failures &failures);
