#pragma once

#include <cstdint>
#include <filesystem>
#include <functional>
#include <string>
#include <string_view>
#include <system_error>

// Writes `bytes` into the new file `path` and flushes them to the disk. The file is created only
// when no entry of that name exists, so that a file or link planted there is never written
// through. Returns the error when that fails.
std::error_code WriteNewFile(const std::filesystem::path &path, const std::string &bytes);
// Told during a long copy how many bytes of the file are copied so far.
using CopyProgress = std::function<void(std::uint64_t copied)>;
// Copies the file `source` into the new file `path`, created the same way; a source that is a link
// is refused. A file larger than a chunk is copied chunk by chunk, and `progress` (when set) is
// told after each chunk but the last. Returns the error when that fails; a file it created is then
// deleted again, so that nothing half-written stays. `sourceNormal`, when given, is set to
// whether the source is writable and needs no change of attributes (on Windows it stays false:
// every file is made normal there).
std::error_code CopyToNewFile(const std::filesystem::path &source,
                              const std::filesystem::path &path, const CopyProgress &progress = {},
                              bool *sourceNormal = nullptr);
#ifndef _WIN32
// How CopyToNewFile moved the bytes of its last copy on this thread: by copy_file_range, which
// clones blocks where the file system can, or by sendfile or reads and writes where that was
// refused (across file systems, on old kernels). Windows copies with CopyFileExW, which lets the
// system clone blocks on ReFS and Dev Drive volumes.
enum class CopyWay { InKernel, Fallback };
CopyWay LastCopyWay();
#endif
// Whether `error` says that an entry of that name is already there.
bool AlreadyExists(const std::error_code &error);
// The reason of `error` for a message: "the disk is full" when it is, on Windows "in use by
// another program (is the game running?)" for a file held open, else the system's words.
std::string ReasonOf(const std::error_code &error);
// What Windows makes of the name `name`: "a name Windows reserves for a device" (CON, nul.txt),
// "a name Windows cannot keep (it ends in a dot or blank)", or empty for a name it keeps.
std::string WindowsNameProblem(std::string_view name);
// The reason of `error` about the file `path` for a message: on Windows, whose errors for such
// names say nothing to the point, a name it cannot keep; else ReasonOf.
std::string ReasonFor(const std::filesystem::path &path, const std::error_code &error);
