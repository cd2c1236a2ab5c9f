#pragma once

#include "app/failures.h"

#include <filesystem>

// Gives `path` normal attributes: writable (and on Windows not hidden, system or archive).
// False, with the reason in `failures`, when that fails.
bool MakeNormal(const std::filesystem::path &path, Failures &failures);
// Copies `source` over `target` through the temporary file "<target>.partial" and a rename, so
// that `target` is always either the old file or a complete copy; source and copy end normal.
// False, with the reason in `failures`, when the copy could not be put in place; attributes that
// cannot be changed are reported without undoing the copy.
bool CopyReplacing(const std::filesystem::path &source, const std::filesystem::path &target,
                   Failures &failures);
