#include "platform/instance_lock.h"

#include "platform/qt_paths.h"

#include <QCryptographicHash>
#include <QDir>

namespace {

// The lock lives in the system's temporary folder, so that a refused start writes nothing into
// the game folder; its name comes from the game folder's path.
QString LockPath(const std::filesystem::path &eawDir) {
  QString key = QDir::cleanPath(QDir(FromPath(eawDir)).absolutePath());
#ifdef _WIN32
  key = key.toLower();
#endif
  const QByteArray hash = QCryptographicHash::hash(key.toUtf8(), QCryptographicHash::Sha1).toHex();
  return QDir::temp().filePath("eaw-addon-selector-" + QString::fromLatin1(hash.left(16)) +
                               ".lock");
}

} // namespace

InstanceLock::InstanceLock(const std::filesystem::path &eawDir)
    : lock_(std::make_unique<QLockFile>(LockPath(eawDir))) {
  lock_->setStaleLockTime(0);
  // Only another running instance refuses the start; a temporary folder that cannot hold the
  // lock must not keep the player out.
  acquired_ = lock_->tryLock(0) || lock_->error() != QLockFile::LockFailedError;
}
