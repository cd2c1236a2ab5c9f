#pragma once

#include "base/failures.h"

#include <QString>
#include <QWidget>

// Tells the user once what an action could not do: a box over `parent` with `heading` and the
// first failures, the whole list under "Show Details". Nothing is shown when all went well.
void ShowFailures(QWidget *parent, const Failures &failures, const QString &heading);
