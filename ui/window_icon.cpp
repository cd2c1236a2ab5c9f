#include "ui/window_icon.h"

#include <QPainter>
#include <QPainterPath>
#include <QPixmap>

namespace {

QPixmap DrawIcon(int size) {
  QPixmap pixmap(size, size);
  pixmap.fill(Qt::transparent);
  QPainter painter(&pixmap);
  painter.scale(size / 32.0, size / 32.0);
  painter.setPen(Qt::black);
  painter.setBrush(QColor(0, 128, 128));
  painter.drawRect(2, 12, 28, 18);
  painter.setBrush(QColor(255, 255, 0));
  QPainterPath plane;
  plane.moveTo(16, 2);
  plane.lineTo(18, 10);
  plane.lineTo(30, 14);
  plane.lineTo(18, 16);
  plane.lineTo(17, 24);
  plane.lineTo(21, 27);
  plane.lineTo(11, 27);
  plane.lineTo(15, 24);
  plane.lineTo(14, 16);
  plane.lineTo(2, 14);
  plane.lineTo(14, 10);
  plane.closeSubpath();
  painter.drawPath(plane);
  return pixmap;
}

} // namespace

QIcon WindowIcon() {
  QIcon icon;
  icon.addPixmap(DrawIcon(32));
  icon.addPixmap(DrawIcon(16));
  return icon;
}
