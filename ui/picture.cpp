#include "ui/picture.h"

#include "platform/qt_paths.h"

#include <QImageReader>

QPixmap LoadPicture(const std::filesystem::path &file, QSize fit) {
  QImageReader reader(FromPath(file));
  reader.setDecideFormatFromContent(true);
  const QSize size = reader.size();
  if (size.isValid() && (size.width() > fit.width() || size.height() > fit.height()))
    reader.setScaledSize(size.scaled(fit, Qt::KeepAspectRatio));
  const QImage image = reader.read();
  return image.isNull() ? QPixmap() : QPixmap::fromImage(image);
}
