#include "ui/wrapping_button.h"

#include <QPainter>
#include <QStyleOptionButton>
#include <QStylePainter>

void WrappingButton::paintEvent(QPaintEvent *) {
  QStylePainter painter(this);
  QStyleOptionButton option;
  initStyleOption(&option);
  option.text.clear();
  painter.drawControl(QStyle::CE_PushButton, option);
  painter.drawText(rect().adjusted(3, 0, -3, 0), Qt::AlignCenter | Qt::TextWordWrap, text());
}
