#pragma once

#include <string>
#include <string_view>

// Whether a name read from a file may stand for one entry inside a known folder: one plain name,
// never a path. Empty when it may; otherwise why not, in words for a message. Refused: an empty
// name, "." and "..", a separator of either platform, a drive ("C:x"), a NUL or other control
// byte, a name Windows reserves for a device ("CON", "nul.txt", "COM1"), a name Windows cannot
// keep (it ends in a dot or blank) and a name longer than 255 bytes.
std::string PlainNameProblem(std::string_view name);
inline bool IsPlainName(std::string_view name) { return PlainNameProblem(name).empty(); }
