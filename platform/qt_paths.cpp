#include "platform/qt_paths.h"

#include "base/text_encoding.h"

#include <QFile>
#include <QStringDecoder>

namespace fs = std::filesystem;

#ifdef _WIN32
fs::path ToPath(const QString &text) { return fs::path(text.toStdWString()).make_preferred(); }
QString FromPath(const fs::path &path) { return QString::fromStdWString(path.wstring()); }
QString FromName(const std::string &name) { return QString::fromUtf8(name); }
std::string ToName(const QString &text) { return text.toStdString(); }
#else
fs::path ToPath(const QString &text) { return fs::path(QFile::encodeName(text).toStdString()); }
QString FromPath(const fs::path &path) { return QFile::decodeName(path.string().c_str()); }
QString FromName(const std::string &name) { return QFile::decodeName(name.c_str()); }
std::string ToName(const QString &text) { return QFile::encodeName(text).toStdString(); }
#endif

QString FromText(const std::string &bytes, bool *ansi) {
  const bool utf8 = IsUtf8(bytes);
  if (ansi)
    *ansi = !utf8;
  const std::string text = utf8 ? bytes : AnsiToUtf8(bytes);
  // A byte-order mark is part of the file, so it stays in the text.
  QStringDecoder decoder(QStringDecoder::Utf8, QStringConverter::Flag::ConvertInitialBom);
  return decoder(QByteArrayView(text.data(), static_cast<qsizetype>(text.size())));
}

std::string ToText(const QString &text, bool ansi) {
  const std::string utf8 = text.toStdString();
  return ansi ? ToAnsi(utf8) : utf8;
}
