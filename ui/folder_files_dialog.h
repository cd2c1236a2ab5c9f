#pragma once

#include "app/selector.h"

#include <QWidget>

// Opens, over `parent`, the dialog that lists the files of one folder: where each goes, its state
// now and the other folders with the same names, in a table sortable by each column. It closes
// itself and is deleted when closed.
void OpenFolderFilesDialog(QWidget *parent, FolderFileList list);
