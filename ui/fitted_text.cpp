#include "ui/fitted_text.h"

#include <QFontMetrics>
#include <climits>

QString FittedText(const QLabel *label, const QString &text) {
  const QFontMetrics metrics(label->font());
  const QRect wrapped(0, 0, label->width(), INT_MAX);
  const auto fits = [&](const QString &candidate) {
    return metrics.boundingRect(wrapped, Qt::TextWordWrap, candidate).height() <= label->height();
  };
  if (fits(text))
    return text;
  QString cut = text;
  while (!cut.isEmpty() && !fits(cut + "..."))
    cut.chop(1);
  return cut + "...";
}
