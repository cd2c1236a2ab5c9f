#include "base/new_file.h"

#include "base/links.h"
#include "base/names.h"

#ifdef _WIN32
#include <algorithm>

#include <windows.h>
#else
#include <algorithm>
#include <cerrno>
#include <fcntl.h>
#include <sys/sendfile.h>
#include <sys/stat.h>
#include <unistd.h>
#endif

namespace fs = std::filesystem;

// How much a copy moves between two reports of its progress: a few tenths of a second on a slow
// disk, nothing to count on a fast one.
static constexpr std::uint64_t kChunkBytes = 4 << 20;

#ifdef _WIN32
static std::error_code LastError() {
  return std::error_code(static_cast<int>(GetLastError()), std::system_category());
}

std::error_code WriteNewFile(const fs::path &path, const std::string &bytes) {
  // CREATE_NEW refuses any existing entry; a reparse point is opened, never followed.
  HANDLE file = CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW,
                            FILE_ATTRIBUTE_NORMAL | FILE_FLAG_OPEN_REPARSE_POINT, nullptr);
  if (file == INVALID_HANDLE_VALUE)
    return LastError();
  std::error_code error;
  for (size_t done = 0; done < bytes.size() && !error;) {
    const DWORD chunk = static_cast<DWORD>(std::min<size_t>(bytes.size() - done, 1 << 20));
    DWORD written = 0;
    if (WriteFile(file, bytes.data() + done, chunk, &written, nullptr))
      done += written;
    else
      error = LastError();
  }
  if (!error && !FlushFileBuffers(file))
    error = LastError();
  CloseHandle(file);
  return error;
}

static std::error_code LinkError() {
  return std::make_error_code(std::errc::too_many_symbolic_link_levels);
}

static DWORD CALLBACK ReportCopied(LARGE_INTEGER size, LARGE_INTEGER copied, LARGE_INTEGER,
                                   LARGE_INTEGER, DWORD, DWORD, HANDLE, HANDLE, LPVOID data) {
  if (copied.QuadPart < size.QuadPart)
    (*static_cast<const CopyProgress *>(data))(static_cast<std::uint64_t>(copied.QuadPart));
  return PROGRESS_CONTINUE;
}

std::error_code CopyToNewFile(const fs::path &source, const fs::path &path,
                              const CopyProgress &progress, [[maybe_unused]] bool *sourceNormal) {
  if (IsLink(source))
    return LinkError();
  // Asked first, so that what a failed copy leaves behind is surely its own to delete.
  if (GetFileAttributesW(path.c_str()) != INVALID_FILE_ATTRIBUTES)
    return std::error_code(ERROR_FILE_EXISTS, std::system_category());
  // A source that became a link since is copied as the link, never as what it points at, and the
  // copy is then deleted again. Windows reports each chunk it copies to a listener.
  const DWORD flags = COPY_FILE_FAIL_IF_EXISTS | COPY_FILE_COPY_SYMLINK;
  const LPPROGRESS_ROUTINE report = progress ? ReportCopied : nullptr;
  std::error_code error;
  if (!CopyFileExW(source.c_str(), path.c_str(), report, const_cast<CopyProgress *>(&progress),
                   nullptr, flags))
    error = LastError();
  else if (IsLink(path))
    error = LinkError();
  if (error && !AlreadyExists(error)) {
    // A link is deleted as it is; its attributes would be those of what it points at.
    if (!IsLink(path))
      SetFileAttributesW(path.c_str(), FILE_ATTRIBUTE_NORMAL);
    DeleteFileW(path.c_str());
  }
  return error;
}
#else
static std::error_code LastError() { return std::error_code(errno, std::generic_category()); }

// Writes all of `size` bytes, going on after a short write.
static bool WriteAll(int file, const char *data, size_t size) {
  while (size > 0) {
    const ssize_t written = ::write(file, data, size);
    if (written < 0 && errno == EINTR)
      continue;
    if (written <= 0)
      return false;
    data += written;
    size -= static_cast<size_t>(written);
  }
  return true;
}

// O_EXCL refuses any existing entry, also a link, dangling or not.
static int CreateNew(const fs::path &path) {
  return ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
}

std::error_code WriteNewFile(const fs::path &path, const std::string &bytes) {
  const int file = CreateNew(path);
  if (file < 0)
    return LastError();
  std::error_code error;
  if (!WriteAll(file, bytes.data(), bytes.size()) || ::fdatasync(file) != 0)
    error = LastError();
  if (::close(file) != 0 && !error)
    error = LastError();
  return error;
}

static thread_local CopyWay lastWay = CopyWay::InKernel;

CopyWay LastCopyWay() { return lastWay; }

// Moves up to `size` bytes from `in` to `out`, both at their file positions, as the kernel can;
// returns what it moved, or -1 with errno.
using Mover = ssize_t (*)(int in, int out, size_t size);

// Within one file system that shares blocks (XFS with reflink, Btrfs) this clones them: no time,
// no space, and a later write to either file leaves the other as it was.
static ssize_t CopyRange(int in, int out, size_t size) {
  return ::copy_file_range(in, nullptr, out, nullptr, size, 0);
}

static ssize_t SendFile(int in, int out, size_t size) { return ::sendfile(out, in, nullptr, size); }

// Whether the kernel turns the way down as such (across file systems, on a file system or kernel
// that lacks it), so that another way may still copy the file.
static bool Refused(int error) {
  return error == EXDEV || error == EINVAL || error == ENOSYS || error == EOPNOTSUPP ||
         error == EPERM;
}

enum class Moved { all, refused, failed };

// Moves what is left of `size` bytes chunk by chunk with `move`, counting them in `copied` and
// calling `report` after each chunk; a source that ends early ends the copy there.
template <typename Report>
static Moved MoveChunks(Mover move, int in, int out, std::uint64_t size, std::uint64_t &copied,
                        const Report &report) {
  while (copied < size) {
    const ssize_t sent = move(in, out, static_cast<size_t>(std::min(size - copied, kChunkBytes)));
    if (sent < 0 && errno == EINTR)
      continue;
    if (sent < 0 && Refused(errno))
      return Moved::refused;
    if (sent <= 0)
      return sent == 0 ? Moved::all : Moved::failed;
    copied += static_cast<std::uint64_t>(sent);
    report();
  }
  return Moved::all;
}

// Copies what is left of `in` (`size` bytes by its size) into `out`, chunk by chunk, telling
// `progress` after each chunk but the last: copy_file_range first, then sendfile, then reads and
// writes for what neither would move (a size of 0 may hide content, as in /proc).
static bool CopyContent(int in, int out, off_t size, const CopyProgress &progress) {
  const auto total = static_cast<std::uint64_t>(size);
  std::uint64_t copied = 0;
  const auto report = [&] {
    if (progress && copied < total)
      progress(copied);
  };
  lastWay = CopyWay::InKernel;
  Moved moved = MoveChunks(CopyRange, in, out, total, copied, report);
  if (moved == Moved::refused) {
    lastWay = CopyWay::Fallback;
    moved = MoveChunks(SendFile, in, out, total, copied, report);
  }
  if (moved == Moved::failed)
    return false;
  if (total > 0 && copied == total)
    return true;
  lastWay = CopyWay::Fallback;
  char buffer[1 << 16];
  std::uint64_t reported = copied;
  for (;;) {
    const ssize_t got = ::read(in, buffer, sizeof buffer);
    if (got < 0 && errno == EINTR)
      continue;
    if (got <= 0)
      return got == 0;
    if (!WriteAll(out, buffer, static_cast<size_t>(got)))
      return false;
    copied += static_cast<std::uint64_t>(got);
    if (copied - reported >= kChunkBytes) {
      reported = copied;
      report();
    }
  }
}

std::error_code CopyToNewFile(const fs::path &source, const fs::path &path,
                              const CopyProgress &progress, bool *sourceNormal) {
  const int in = ::open(source.c_str(), O_RDONLY | O_NOFOLLOW | O_CLOEXEC);
  if (in < 0)
    return errno == ELOOP ? std::make_error_code(std::errc::too_many_symbolic_link_levels)
                          : LastError();
  struct stat info {};
  if (::fstat(in, &info) != 0 || !S_ISREG(info.st_mode)) {
    const std::error_code error =
        S_ISREG(info.st_mode) ? LastError() : std::make_error_code(std::errc::invalid_argument);
    ::close(in);
    return error;
  }
  if (sourceNormal)
    *sourceNormal = (info.st_mode & S_IWUSR) != 0;
  const int out = CreateNew(path);
  if (out < 0) {
    const std::error_code error = LastError();
    ::close(in);
    return error;
  }
  std::error_code error;
  if (!CopyContent(in, out, info.st_size, progress))
    error = LastError();
  if (::close(out) != 0 && !error)
    error = LastError();
  ::close(in);
  if (error)
    ::unlink(path.c_str());
  return error;
}
#endif

bool AlreadyExists(const std::error_code &error) {
#ifdef _WIN32
  if (error.category() == std::system_category() &&
      (error.value() == ERROR_FILE_EXISTS || error.value() == ERROR_ALREADY_EXISTS))
    return true;
#endif
  return error == std::errc::file_exists;
}

std::string ReasonOf(const std::error_code &error) {
  if (error == std::errc::no_space_on_device)
    return "the disk is full";
#ifdef _WIN32
  if (error.category() == std::system_category() &&
      (error.value() == ERROR_DISK_FULL || error.value() == ERROR_HANDLE_DISK_FULL))
    return "the disk is full";
#endif
  if (error == std::errc::too_many_symbolic_link_levels)
    return "it is a link, and the program does not follow links";
#ifdef _WIN32
  // The program makes every file writable before it changes it: what is still refused is held
  // open by another program.
  if (error == std::errc::permission_denied ||
      (error.category() == std::system_category() &&
       (error.value() == ERROR_SHARING_VIOLATION || error.value() == ERROR_LOCK_VIOLATION)))
    return "in use by another program (is the game running?)";
#endif
  return error.message();
}

std::string WindowsNameProblem(std::string_view name) {
  if (!name.empty() && (name.back() == '.' || name.back() == ' '))
    return "a name Windows cannot keep (it ends in a dot or blank)";
  // A device name is one whatever extension follows it, and with blanks before the extension.
  std::string stem(name.substr(0, name.find('.')));
  while (!stem.empty() && stem.back() == ' ')
    stem.pop_back();
  for (char &c : stem)
    c = static_cast<char>(c >= 'a' && c <= 'z' ? c - 'a' + 'A' : c);
  const bool numbered = stem.size() == 4 &&
                        (stem.rfind("COM", 0) == 0 || stem.rfind("LPT", 0) == 0) &&
                        stem[3] >= '1' && stem[3] <= '9';
  if (numbered || stem == "CON" || stem == "PRN" || stem == "AUX" || stem == "NUL")
    return "a name Windows reserves for a device";
  return "";
}

std::string ReasonFor([[maybe_unused]] const fs::path &path, const std::error_code &error) {
#ifdef _WIN32
  const std::string problem = WindowsNameProblem(NameText(path));
  if (!problem.empty())
    return problem;
#endif
  return ReasonOf(error);
}
