#include "ui/folder_files_dialog.h"

#include "platform/qt_paths.h"
#include "ui/folder_files_model.h"
#include "ui/window_layout.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QHeaderView>
#include <QLabel>
#include <QTableView>
#include <QVBoxLayout>

namespace {

// The other folders named in the heading; the table names them all.
constexpr size_t kNamedConflicts = 8;

QString Heading(const FolderFileList &list) {
  QString text = QString("\"%1\" is %2 and has %3 %4 that a load copies into the game.")
                     .arg(FromName(list.folder), list.loaded ? "loaded" : "not loaded")
                     .arg(list.files.size())
                     .arg(list.files.size() == 1 ? "file" : "files");
  if (list.conflicts.empty())
    return text + "\nNo other folder of the library has files of the same names.";
  text += QString("\n%1 other %2 of the library %3 files of the same names: ")
              .arg(list.conflicts.size())
              .arg(list.conflicts.size() == 1 ? "folder" : "folders",
                   list.conflicts.size() == 1 ? "has" : "have");
  for (size_t i = 0; i < list.conflicts.size() && i < kNamedConflicts; ++i)
    text +=
        QString(i ? ", " : "") +
        QString("\"%1\" (%2)").arg(FromName(list.conflicts[i].first)).arg(list.conflicts[i].second);
  if (list.conflicts.size() > kNamedConflicts)
    text += QString(" and %1 more").arg(list.conflicts.size() - kNamedConflicts);
  return text + ".";
}

QTableView *FilesTable(QDialog *dialog, FolderFileList list) {
  auto *table = new QTableView(dialog);
  table->setObjectName("FolderFilesTable");
  auto *model = new FolderFilesModel(std::move(list), table);
  table->setModel(model);
  table->setSortingEnabled(true);
  table->sortByColumn(0, Qt::AscendingOrder);
  table->setSelectionBehavior(QAbstractItemView::SelectRows);
  table->setEditTriggers(QAbstractItemView::NoEditTriggers);
  table->setWordWrap(false);
  table->verticalHeader()->hide();
  table->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
  table->verticalHeader()->setDefaultSectionSize(table->fontMetrics().height() + 4);
  // Fixed widths: measuring thousands of rows would make the dialog slow to open.
  const int widths[] = {180, 90, 330};
  for (int column = 0; column < 3; ++column)
    table->setColumnWidth(column, widths[column]);
  table->horizontalHeader()->setStretchLastSection(true);
  return table;
}

} // namespace

void OpenFolderFilesDialog(QWidget *parent, FolderFileList list) {
  auto *dialog = new QDialog(parent);
  dialog->setObjectName("FolderFilesDialog");
  dialog->setAttribute(Qt::WA_DeleteOnClose);
  dialog->setWindowTitle("Files of \"" + FromName(list.folder) + "\"");
  dialog->setFont(WindowFont(8.25));
  auto *layout = new QVBoxLayout(dialog);
  auto *heading = new QLabel(Heading(list), dialog);
  heading->setObjectName("FolderFilesHeading");
  heading->setWordWrap(true);
  layout->addWidget(heading);
  layout->addWidget(FilesTable(dialog, std::move(list)));
  auto *buttons = new QDialogButtonBox(QDialogButtonBox::Close, dialog);
  QObject::connect(buttons, &QDialogButtonBox::rejected, dialog, &QDialog::reject);
  layout->addWidget(buttons);
  dialog->resize(860, 480);
  dialog->open();
}
