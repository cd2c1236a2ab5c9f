#pragma once

#include <QLabel>
#include <QString>

// `text`, cut and ended with "..." where it must be, so that wrapped at `label`'s width it fits
// the label's height and crowds nothing below it.
QString FittedText(const QLabel *label, const QString &text);
