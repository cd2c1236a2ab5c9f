#pragma once

#include "base/failures.h"

#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// What the music part of the window shows.
struct MusicList {
  std::vector<std::string> entries;   // the inactive sets, in Music.ini order
  std::optional<std::string> current; // the active set; nothing keeps what the window shows
};

// Whether `name` is a folder the program or the game relies on ("ZEP128", "Savedata", "Music",
// in any letter case): a switch would rename it away.
bool IsReservedFolderName(std::string_view name);
// Why a Music.ini line cannot name a folder of the game folder, or empty when it can: it must be
// one plain name (see PlainNameProblem) but for trailing blanks and dots, which Windows drops.
std::string MusicSetProblem(std::string_view line);
// Whether a Music.ini line can name a set: MusicSetProblem finds nothing, and it is not a
// reserved folder.
bool IsMusicSetName(std::string_view line);
// The music sets of Music.ini (found whatever its letter case): a name whose folder exists is an
// entry; the last name without a folder is the current set. A missing file gives nothing; a line
// that is not a plain name is named in `failures` and left out.
MusicList FillMusicList(const std::filesystem::path &eawDir, Failures &failures);
