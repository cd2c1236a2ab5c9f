#pragma once

#include "base/failures.h"
#include "base/new_file.h"

#include <filesystem>
#include <string>

// Gives `path` normal attributes: writable (and on Windows not hidden, system or archive).
// False, with the reason in `failures`, when that fails.
bool MakeNormal(const std::filesystem::path &path, Failures &failures);
// Makes `path` writable and changes nothing else. False, with the reason, when that fails.
bool MakeWritable(const std::filesystem::path &path, Failures &failures);
// Replaces `target` by `bytes` through a temporary file beside it and a rename, so that the file
// is always either the old or the new one, also after a power cut (both are flushed to the disk); a
// replaced file keeps its permissions (on Windows its hidden and system attributes) and ends
// writable. Returns false, with the reason, on failure; the old file is then left as it was.
bool WriteAtomically(const std::filesystem::path &target, const std::string &bytes,
                     Failures &failures);
// Copies `source` over `target` through the temporary file "<target>.partial" and a rename, so
// that `target` is always either the old file or a complete copy; source and copy end normal.
// False, with the reason in `failures`, when the copy could not be put in place; attributes that
// cannot be changed are reported without undoing the copy. `progress` hears how far a big copy is.
bool CopyReplacing(const std::filesystem::path &source, const std::filesystem::path &target,
                   Failures &failures, const CopyProgress &progress = {});
// CopyReplacing for a copy listed in the journal of the operation, whose recovery deletes what a
// crash left: a name that is still free is written directly, without the temporary file; a failed
// copy deletes what it wrote.
bool CopyJournaled(const std::filesystem::path &source, const std::filesystem::path &target,
                   Failures &failures, const CopyProgress &progress = {});
// Deletes the file `path`, also a read-only one. False when it cannot be deleted: `failures` then
// names it with `problem` and the reason, and its attributes are as they were.
bool RemoveFile(const std::filesystem::path &path, Failures &failures,
                const std::string &problem = "cannot be deleted");
// The temporary file beside `target` that a replacement is written to before it is renamed.
std::filesystem::path PartialPath(const std::filesystem::path &target);
// Removes what a failed replacement left, but never a folder that merely has the temporary name.
void RemovePartial(const std::filesystem::path &partial);
// Waits until the entries of `folder` (a rename, a deletion) are on the disk; on Windows, where
// renames are written through, it does nothing.
void FlushFolder(const std::filesystem::path &folder);
// Waits until everything written to the file system that holds `folder` is on the disk: one
// flush for all the copies of an operation. On Windows it does nothing (see the README).
void FlushFileSystem(const std::filesystem::path &folder);
