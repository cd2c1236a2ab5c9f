#pragma once

#include "base/failures.h"

#include <QString>
#include <QWidget>
#include <string>
#include <vector>

// Tells the user once what an action could not do: a box over `parent` with `heading` and the
// first failures, the whole list under "Show Details". Nothing is shown when all went well.
void ShowFailures(QWidget *parent, const Failures &failures, const QString &heading);
// Tells the user `notice` in a box over `parent`; nothing when it is empty.
void ShowNotice(QWidget *parent, const std::string &notice);
// Asks before files are deleted: a box with their number, the first names and the whole list
// under "Show Details". True when the user chose OK.
bool ConfirmDeletion(QWidget *parent, const std::vector<std::string> &names);
// Asks `question` in a box over `parent` with OK and Cancel, Cancel the default. True for OK.
bool Confirm(QWidget *parent, const QString &question);
