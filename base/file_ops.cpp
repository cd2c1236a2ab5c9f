#include "base/file_ops.h"

#include "base/links.h"
#include "base/names.h"
#include "base/new_file.h"
#include "base/step_seam.h"
#include "base/text_file.h"

#include <cstdio>
#include <functional>
#include <optional>
#include <system_error>

#ifdef _WIN32
#include <windows.h>
#else
#include <fcntl.h>
#include <unistd.h>
#endif

namespace fs = std::filesystem;

#ifdef _WIN32
bool MakeNormal(const fs::path &path, Failures &failures) {
  // A link is replaced or deleted as it is; its attributes would be those of what it points at.
  if (IsLink(path) || SetFileAttributesW(path.c_str(), FILE_ATTRIBUTE_NORMAL))
    return true;
  failures.Add(path, "cannot be made writable (" +
                         std::system_category().message(static_cast<int>(GetLastError())) + ")");
  return false;
}
#else
bool MakeNormal(const fs::path &path, Failures &failures) {
  return IsLink(path) || MakeWritable(path, failures);
}
#endif

bool MakeWritable(const fs::path &path, Failures &failures) {
  // A link is renamed over or deleted without write access, and changing it would change its
  // target.
  if (IsLink(path))
    return true;
  std::error_code error;
  const fs::perms perms = fs::status(path, error).permissions();
  if (!error && (perms & fs::perms::owner_write) != fs::perms::none)
    return true;
  if (!error)
    fs::permissions(path, perms | fs::perms::owner_write, fs::perm_options::replace, error);
  if (!error)
    return true;
  failures.Add(path, "cannot be made writable (" + error.message() + ")");
  return false;
}

fs::path PartialPath(const fs::path &target) {
  // Names may have 255 bytes: a long one gives its temporary name a short stem and its hash, so
  // that every name can be copied.
  constexpr size_t kLongest = 255, kKeptBytes = 200;
  std::string name = NameText(target);
  if (name.size() + std::string_view(".partial").size() > kLongest) {
    size_t cut = kKeptBytes;
    while (cut > 0 && (static_cast<unsigned char>(name[cut]) & 0xC0) == 0x80)
      --cut;
    char hash[20];
    std::snprintf(hash, sizeof hash, "~%08zx", std::hash<std::string>{}(name)&0xFFFFFFFFu);
    name = name.substr(0, cut) + hash;
  }
  return Child(target.parent_path(), name + ".partial");
}

#ifndef _WIN32
// Calls `flush` with an open descriptor of `folder`; nothing when it cannot be opened.
static void FlushThrough(const fs::path &folder, int (*flush)(int)) {
  const int descriptor = ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
  if (descriptor >= 0) {
    flush(descriptor);
    ::close(descriptor);
  }
}
#endif

void FlushFolder([[maybe_unused]] const fs::path &folder) {
#ifndef _WIN32
  FlushThrough(folder, ::fsync);
#endif
}

void FlushFileSystem([[maybe_unused]] const fs::path &folder) {
#ifndef _WIN32
  FlushThrough(folder, ::syncfs);
#endif
}

void RemovePartial(const fs::path &partial) {
  std::error_code error;
  // A link of that name is removed itself, never what it points to.
  const bool link = IsLink(partial);
  if (!link && !fs::is_regular_file(fs::symlink_status(partial, error)))
    return;
#ifdef _WIN32
  // A copy of a read-only file left by a crash is read-only too, and Windows keeps it otherwise.
  if (!link)
    SetFileAttributesW(partial.c_str(), FILE_ATTRIBUTE_NORMAL);
#endif
  fs::remove(partial, error);
}

// Renames `from` over `to` and waits until the rename is on the disk, so that a power cut
// leaves the old file or the new one in place, never an empty one.
static std::error_code RenameDurably(const fs::path &from, const fs::path &to) {
#ifdef _WIN32
  if (MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH))
    return {};
  return std::error_code(static_cast<int>(GetLastError()), std::system_category());
#else
  std::error_code error;
  fs::rename(from, to, error);
  if (!error)
    FlushFolder(to.parent_path());
  return error;
#endif
}

static std::optional<fs::perms> PermissionsOf(const fs::path &path) {
  std::error_code error;
  const fs::file_status status = fs::status(path, error);
  if (error || !fs::exists(status))
    return std::nullopt;
  return status.permissions();
}

bool WriteAtomically(const fs::path &target, const std::string &bytes, Failures &failures) {
  std::error_code error;
  if (IsLink(target)) {
    failures.Add(target, kLinkReason);
    return false;
  }
  const fs::path temporary = PartialPath(target);
  RemovePartial(temporary);
  error = WriteNewFile(temporary, bytes);
  if (error) {
    failures.Add(target, "cannot be written (" + ReasonFor(target, error) + ")");
    RemovePartial(temporary);
    return false;
  }
  // Windows refuses to rename over a read-only file.
  const std::optional<fs::perms> before = PermissionsOf(target);
#ifdef _WIN32
  const DWORD attributes = GetFileAttributesW(target.c_str());
#endif
  if (before && !MakeWritable(target, failures)) {
    RemovePartial(temporary);
    return false;
  }
  error = RenameDurably(temporary, target);
  if (error) {
    failures.Add(target, "cannot be replaced (" + ReasonFor(target, error) + ")");
    RemovePartial(temporary);
    if (before)
      fs::permissions(target, *before, error);
    return false;
  }
  if (before)
    fs::permissions(target, *before | fs::perms::owner_write, error);
#ifdef _WIN32
  // A hidden or system file stays so; only read-only is gone.
  if (attributes != INVALID_FILE_ATTRIBUTES)
    SetFileAttributesW(target.c_str(), attributes & ~DWORD{FILE_ATTRIBUTE_READONLY});
#endif
  StepDone();
  return true;
}

static void AddCopyFailure(const fs::path &source, const fs::path &target,
                           const std::error_code &error, Failures &failures) {
  failures.Add(source, "cannot be copied to " + DisplayPath(target) + " (" +
                           ReasonFor(target, error) + ")");
}

// Copies `source` over `target` by way of a temporary file beside it, so that the target is
// either the old file or the whole new one.
static bool CopyOver(const fs::path &source, const fs::path &target, Failures &failures,
                     const CopyProgress &progress, bool &sourceNormal) {
  const fs::path temporary = PartialPath(target);
  std::error_code error = CopyToNewFile(source, temporary, progress, &sourceNormal);
  if (AlreadyExists(error)) {
    // What an interrupted copy left must not block this one.
    RemovePartial(temporary);
    error = CopyToNewFile(source, temporary, progress, &sourceNormal);
  }
  if (error) {
    AddCopyFailure(source, target, error, failures);
    RemovePartial(temporary);
    return false;
  }
#ifdef _WIN32
  // Windows refuses to replace a read-only file; a link is replaced as it is.
  if (!IsLink(target))
    SetFileAttributesW(target.c_str(), FILE_ATTRIBUTE_NORMAL);
#endif
  fs::rename(temporary, target, error);
  if (error) {
    failures.Add(target, "cannot be replaced (" + ReasonFor(target, error) + ")");
    RemovePartial(temporary);
    return false;
  }
  StepDone();
  return true;
}

// The copy carries the source's attributes, so a normal source leaves nothing to do.
static void MakeBothNormal(const fs::path &source, const fs::path &target, bool sourceNormal,
                           Failures &failures) {
  if (!sourceNormal) {
    MakeNormal(source, failures);
    MakeNormal(target, failures);
  }
}

bool CopyReplacing(const fs::path &source, const fs::path &target, Failures &failures,
                   const CopyProgress &progress) {
  bool sourceNormal = false;
  if (!CopyOver(source, target, failures, progress, sourceNormal))
    return false;
  MakeBothNormal(source, target, sourceNormal, failures);
  return true;
}

bool CopyJournaled(const fs::path &source, const fs::path &target, Failures &failures,
                   const CopyProgress &progress) {
  // Only a file to replace needs the temporary, which costs a rename per file.
  bool sourceNormal = false;
  const std::error_code error = CopyToNewFile(source, target, progress, &sourceNormal);
  if (AlreadyExists(error))
    return CopyReplacing(source, target, failures, progress);
  if (error) {
    AddCopyFailure(source, target, error, failures);
    return false;
  }
  MakeBothNormal(source, target, sourceNormal, failures);
  StepDone();
  return true;
}

#ifdef _WIN32
// Windows refuses to delete a read-only file: clears the attribute and returns the attributes to
// put back if the deletion fails anyway.
static DWORD AllowDeletion(const fs::path &path) {
  const DWORD attributes = GetFileAttributesW(path.c_str());
  if (attributes == INVALID_FILE_ATTRIBUTES || !(attributes & FILE_ATTRIBUTE_READONLY) ||
      (attributes & FILE_ATTRIBUTE_REPARSE_POINT))
    return INVALID_FILE_ATTRIBUTES;
  SetFileAttributesW(path.c_str(), attributes & ~DWORD{FILE_ATTRIBUTE_READONLY});
  return attributes;
}
#endif

bool RemoveFile(const fs::path &path, Failures &failures, const std::string &problem) {
#ifdef _WIN32
  const DWORD restore = AllowDeletion(path);
#endif
  std::error_code error;
  fs::remove(path, error);
  if (!error) {
    StepDone();
    return true;
  }
#ifdef _WIN32
  if (restore != INVALID_FILE_ATTRIBUTES)
    SetFileAttributesW(path.c_str(), restore);
#endif
  failures.Add(path, problem + " (" + ReasonFor(path, error) + ")");
  return false;
}
