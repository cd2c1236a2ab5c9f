// make_icon <file.ico>: writes the window's icon as the Windows icon file the executable carries,
// in 16 colours with a 32 by 32 and a 16 by 16 image. ui/eawselector.ico is made by it.
#include "ui/window_icon.h"

#include <QApplication>
#include <QFile>
#include <QImage>
#include <QtEndian>

namespace {

// The 16 colours of the standard Windows palette.
const QList<QRgb> kPalette = {
    0xff000000, 0xff800000, 0xff008000, 0xff808000, 0xff000080, 0xff800080, 0xff008080, 0xffc0c0c0,
    0xff808080, 0xffff0000, 0xff00ff00, 0xffffff00, 0xff0000ff, 0xffff00ff, 0xff00ffff, 0xffffffff};

void Put16(QByteArray &out, quint16 value) {
  value = qToLittleEndian(value);
  out.append(reinterpret_cast<const char *>(&value), 2);
}

void Put32(QByteArray &out, quint32 value) {
  value = qToLittleEndian(value);
  out.append(reinterpret_cast<const char *>(&value), 4);
}

// One icon image: a 4-bit bitmap, bottom row first, then its transparency mask.
QByteArray IconImage(const QImage &argb) {
  const int size = argb.width();
  const QImage indexed =
      argb.convertToFormat(QImage::Format_Indexed8, kPalette, Qt::ThresholdDither);
  QByteArray out;
  for (quint32 value : {40u, quint32(size), quint32(size * 2)})
    Put32(out, value);
  Put16(out, 1);
  Put16(out, 4);
  for (int field = 0; field < 6; ++field)
    Put32(out, field == 4 ? 16 : 0);
  for (QRgb colour : kPalette)
    Put32(out, colour & 0xffffff);
  const int colourRow = (size / 2 + 3) / 4 * 4, maskRow = (size / 8 + 3) / 4 * 4;
  for (int y = size - 1; y >= 0; --y) {
    QByteArray row(colourRow, '\0');
    for (int x = 0; x < size; ++x)
      row[x / 2] = char(row[x / 2] | (indexed.pixelIndex(x, y) << (x % 2 ? 0 : 4)));
    out += row;
  }
  for (int y = size - 1; y >= 0; --y) {
    QByteArray row(maskRow, '\0');
    for (int x = 0; x < size; ++x)
      if (qAlpha(argb.pixel(x, y)) < 128)
        row[x / 8] = char(row[x / 8] | (0x80 >> (x % 8)));
    out += row;
  }
  return out;
}

} // namespace

int main(int argc, char *argv[]) {
  QApplication app(argc, argv);
  if (argc != 2)
    return 2;
  QByteArray file;
  Put16(file, 0);
  Put16(file, 1);
  Put16(file, 2);
  QByteArray images;
  const int sizes[] = {32, 16};
  quint32 offset = 6 + 16 * 2;
  for (int size : sizes) {
    const QByteArray image =
        IconImage(WindowIcon().pixmap(size, size).toImage().convertToFormat(QImage::Format_ARGB32));
    file.append(char(size)).append(char(size)).append(char(16)).append(char(0));
    Put16(file, 1);
    Put16(file, 4);
    Put32(file, quint32(image.size()));
    Put32(file, offset);
    offset += quint32(image.size());
    images += image;
  }
  QFile out(QString::fromLocal8Bit(argv[1]));
  return out.open(QIODevice::WriteOnly) && out.write(file + images) == file.size() + images.size()
             ? 0
             : 1;
}
