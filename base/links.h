#pragma once

#include "base/failures.h"

#include <filesystem>
#include <string>

// Why the program leaves a link alone, for messages.
inline constexpr char kLinkReason[] =
    "is a link; the program does not write, move, delete or change anything through a link, so "
    "that nothing outside the game folder changes";

// Whether `path` itself is a link: a symbolic link, or on Windows a junction or any other reparse
// point. The link is not followed; a missing path is no link.
bool IsLink(const std::filesystem::path &path);
// Names `link` in `failures` with why links are left alone and `consequence` ("nothing was
// loaded").
void RefuseLink(const std::filesystem::path &link, const std::string &consequence,
                Failures &failures);
