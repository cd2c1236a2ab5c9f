#pragma once

#include "base/failures.h"

#include <QMessageBox>
#include <QString>
#include <QWidget>
#include <functional>
#include <string>
#include <vector>

// Tells the user once what an action could not do: a box over `parent` with `heading` and the
// first failures, the whole list under "Show Details". Nothing is shown when all went well.
void ShowFailures(QWidget *parent, const Failures &failures, const QString &heading);
// Tells the user `notice` in a box over `parent`: its first line, then the first of its further
// lines and all of them under "Show Details". Nothing when it is empty.
void ShowNotice(QWidget *parent, const std::string &notice);
// Asks before Reset All: a box with how many files of loaded folders it takes out, how many other
// files `names` it deletes, their first names and the whole list under "Show Details". Cancel is
// the default button. True when the user chose OK.
bool ConfirmDeletion(QWidget *parent, int loadedFiles, const std::vector<std::string> &names);
// Asks `question` in a box over `parent` with OK and Cancel, Cancel the default. True for OK.
bool Confirm(QWidget *parent, const QString &question);
// For tests: the next question (Confirm, ConfirmDeletion) is not shown; `answer` is given its box
// and returns the button chosen.
void SetNextAnswer(std::function<QMessageBox::StandardButton(const QMessageBox &)> answer);
