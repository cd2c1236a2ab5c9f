#include "base/file_ops.h"

#include "base/names.h"
#include "base/new_file.h"
#include "base/text_file.h"

#include <cstdio>
#include <functional>
#include <optional>
#include <system_error>

#ifdef _WIN32
#include <windows.h>
#endif

namespace fs = std::filesystem;

#ifdef _WIN32
// Hidden, system and archive cannot be told apart cheaply here: every file is made normal.
static bool IsNormal(const fs::path &) { return false; }

bool MakeNormal(const fs::path &path, Failures &failures) {
  if (SetFileAttributesW(path.c_str(), FILE_ATTRIBUTE_NORMAL))
    return true;
  failures.Add(path, "cannot be made writable (" +
                         std::system_category().message(static_cast<int>(GetLastError())) + ")");
  return false;
}
#else
static bool IsNormal(const fs::path &path) {
  std::error_code error;
  return (fs::status(path, error).permissions() & fs::perms::owner_write) != fs::perms::none;
}

bool MakeNormal(const fs::path &path, Failures &failures) { return MakeWritable(path, failures); }
#endif

bool MakeWritable(const fs::path &path, Failures &failures) {
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

void RemovePartial(const fs::path &partial) {
  std::error_code error;
  // A link of that name is removed itself, never what it points to.
  const fs::file_status status = fs::symlink_status(partial, error);
  if (!fs::is_regular_file(status) && !fs::is_symlink(status))
    return;
#ifdef _WIN32
  // A copy of a read-only file left by a crash is read-only too, and Windows keeps it otherwise.
  SetFileAttributesW(partial.c_str(), FILE_ATTRIBUTE_NORMAL);
#endif
  fs::remove(partial, error);
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
  if (fs::is_symlink(target, error)) {
    failures.Add(target, "is a link; the program does not write through links, so that nothing "
                         "outside the game folder changes");
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
  fs::rename(temporary, target, error);
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
                     const CopyProgress &progress) {
  const fs::path temporary = PartialPath(target);
  std::error_code error = CopyToNewFile(source, temporary, progress);
  if (AlreadyExists(error)) {
    // What an interrupted copy left must not block this one.
    RemovePartial(temporary);
    error = CopyToNewFile(source, temporary, progress);
  }
  if (error) {
    AddCopyFailure(source, target, error, failures);
    RemovePartial(temporary);
    return false;
  }
#ifdef _WIN32
  // Windows refuses to replace a read-only file.
  SetFileAttributesW(target.c_str(), FILE_ATTRIBUTE_NORMAL);
#endif
  fs::rename(temporary, target, error);
  if (error) {
    failures.Add(target, "cannot be replaced (" + ReasonFor(target, error) + ")");
    RemovePartial(temporary);
    return false;
  }
  return true;
}

// The copy carries the source's attributes, so a normal source leaves nothing to do.
static void MakeBothNormal(const fs::path &source, const fs::path &target, Failures &failures) {
  if (!IsNormal(source)) {
    MakeNormal(source, failures);
    MakeNormal(target, failures);
  }
}

bool CopyReplacing(const fs::path &source, const fs::path &target, Failures &failures,
                   const CopyProgress &progress) {
  if (!CopyOver(source, target, failures, progress))
    return false;
  MakeBothNormal(source, target, failures);
  return true;
}

bool CopyJournaled(const fs::path &source, const fs::path &target, Failures &failures,
                   const CopyProgress &progress) {
  // Only a file to replace needs the temporary, which costs a rename per file.
  const std::error_code error = CopyToNewFile(source, target, progress);
  if (AlreadyExists(error))
    return CopyReplacing(source, target, failures, progress);
  if (error) {
    AddCopyFailure(source, target, error, failures);
    return false;
  }
  MakeBothNormal(source, target, failures);
  return true;
}

#ifdef _WIN32
// Windows refuses to delete a read-only file: clears the attribute and returns the attributes to
// put back if the deletion fails anyway.
static DWORD AllowDeletion(const fs::path &path) {
  const DWORD attributes = GetFileAttributesW(path.c_str());
  if (attributes == INVALID_FILE_ATTRIBUTES || !(attributes & FILE_ATTRIBUTE_READONLY))
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
  if (!error)
    return true;
#ifdef _WIN32
  if (restore != INVALID_FILE_ATTRIBUTES)
    SetFileAttributesW(path.c_str(), restore);
#endif
  failures.Add(path, problem + " (" + ReasonFor(path, error) + ")");
  return false;
}
