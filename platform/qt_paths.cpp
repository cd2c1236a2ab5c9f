#include "platform/qt_paths.h"

#include <QFile>
#include <QStringDecoder>

namespace fs = std::filesystem;

#ifdef _WIN32
fs::path ToPath(const QString &text) { return fs::path(text.toStdWString()); }
QString FromPath(const fs::path &path) { return QString::fromStdWString(path.wstring()); }
QString FromName(const std::string &name) { return QString::fromUtf8(name); }
std::string ToName(const QString &text) { return text.toStdString(); }
#else
fs::path ToPath(const QString &text) { return fs::path(QFile::encodeName(text).toStdString()); }
QString FromPath(const fs::path &path) { return QFile::decodeName(path.string().c_str()); }
QString FromName(const std::string &name) { return QFile::decodeName(name.c_str()); }
std::string ToName(const QString &text) { return QFile::encodeName(text).toStdString(); }
#endif

QString FromText(const std::string &bytes, bool *latin1) {
  QStringDecoder utf8(QStringDecoder::Utf8);
  const QString text = utf8(QByteArrayView(bytes.data(), static_cast<qsizetype>(bytes.size())));
  if (latin1)
    *latin1 = utf8.hasError();
  return utf8.hasError() ? QString::fromLatin1(bytes.data(), static_cast<qsizetype>(bytes.size()))
                         : text;
}

std::string ToText(const QString &text, bool latin1) {
  return latin1 ? text.toLatin1().toStdString() : text.toStdString();
}
