#include "platform/instance_lock.h"

#include "platform/qt_paths.h"

#include <QCryptographicHash>
#include <QDir>

#ifdef _WIN32
#include <windows.h>
#else
#include <cerrno>
#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>
#endif

namespace {

// The lock lives in the system's temporary folder, so that a refused start writes nothing into
// the game folder; its name comes from the game folder's path.
std::filesystem::path LockPath(const std::filesystem::path &eawDir) {
  QString key = QDir::cleanPath(QDir(FromPath(eawDir)).absolutePath());
#ifdef _WIN32
  key = key.toLower();
#endif
  const QByteArray hash = QCryptographicHash::hash(key.toUtf8(), QCryptographicHash::Sha1).toHex();
  return ToPath(
      QDir::temp().filePath("eaw-addon-selector-" + QString::fromLatin1(hash.left(16)) + ".lock"));
}

} // namespace

#ifdef _WIN32
// A file opened without sharing: a second open fails while this handle lives. The handle is not
// inheritable, so the game started by FLY does not keep it, and the file goes with the handle.
InstanceLock::InstanceLock(const std::filesystem::path &eawDir)
    : handle_(CreateFileW(LockPath(eawDir).c_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr,
                          OPEN_ALWAYS, FILE_ATTRIBUTE_TEMPORARY | FILE_FLAG_DELETE_ON_CLOSE,
                          nullptr)) {
  acquired_ = handle_ != INVALID_HANDLE_VALUE || GetLastError() != ERROR_SHARING_VIOLATION;
}

InstanceLock::~InstanceLock() {
  if (handle_ != INVALID_HANDLE_VALUE)
    CloseHandle(handle_);
}
#else
// An advisory lock on an open file: the kernel drops it with the last descriptor, which the game
// started by FLY does not inherit (close-on-exec).
InstanceLock::InstanceLock(const std::filesystem::path &eawDir)
    : fd_(open(LockPath(eawDir).c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0600)) {
  acquired_ = fd_ < 0 || flock(fd_, LOCK_EX | LOCK_NB) == 0 || errno != EWOULDBLOCK;
}

InstanceLock::~InstanceLock() {
  if (fd_ >= 0)
    close(fd_);
}
#endif
