#pragma once

#include "base/failures.h"

#include <cstddef>
#include <filesystem>
#include <string>
#include <string_view>

// Whether a name read from a file may stand for one entry inside a known folder: one plain name,
// never a path. Empty when it may; otherwise why not, in words for a message. Refused: an empty
// name, "." and "..", a separator of either platform, a drive ("C:x"), a NUL or other control
// byte, a name Windows reserves for a device ("CON", "nul.txt", "COM1"), a name Windows cannot
// keep (it ends in a dot or blank) and a name longer than 255 bytes.
std::string PlainNameProblem(std::string_view name);
inline bool IsPlainName(std::string_view name) { return PlainNameProblem(name).empty(); }
// Whether `name`, read from line `line` of the program's own file `file`, is one plain name. When
// not, `failures` names the file, the line and why, and the caller does nothing for that line.
bool AcceptPlainName(std::string_view name, const std::filesystem::path &file, size_t line,
                     Failures &failures);
// Names line `line` of `file` in `failures` as refused for `problem`: nothing is done for it.
void RefuseLine(const std::filesystem::path &file, size_t line, std::string_view name,
                const std::string &problem, Failures &failures);
