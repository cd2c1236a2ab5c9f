#include "ui/setup_menu.h"

#include "platform/qt_paths.h"
#include "ui/event_hook.h"
#include "ui/failure_box.h"
#include "ui/folder_files_dialog.h"
#include "ui/window_layout.h"

#include <QClipboard>
#include <QContextMenuEvent>
#include <QGuiApplication>
#include <QInputDialog>
#include <QMenu>
#include <QMessageBox>
#include <functional>

namespace {

// A name as a menu entry: "&" would mark a shortcut letter.
QString EntryText(const std::string &name) { return FromName(name).replace("&", "&&"); }

QString Quoted(const std::string &name) { return "\"" + FromName(name) + "\""; }

// Asks `text` over `parent` and calls `yes` when the player answers Yes.
void AskThen(QWidget *parent, const char *objectName, const QString &text,
             const std::function<void()> &yes) {
  auto *box = new QMessageBox(QMessageBox::Question, WindowCaptionText().simplified(), text,
                              QMessageBox::Yes | QMessageBox::No, parent);
  box->setObjectName(objectName);
  box->setDefaultButton(QMessageBox::No);
  box->setAttribute(Qt::WA_DeleteOnClose);
  QObject::connect(box, &QMessageBox::buttonClicked, parent, [box, yes](QAbstractButton *button) {
    if (box->standardButton(button) == QMessageBox::Yes)
      yes();
  });
  box->open();
}

} // namespace

SetupMenu::SetupMenu(Selector &selector, VerbRunner &runner, QTableView *grid, QWidget *window)
    : QObject(window), selector_(selector), runner_(runner), grid_(grid), window_(window) {
  // A right-click reaches the grid's viewport, the menu key the grid itself.
  OnEvents(grid_->viewport(), [this](QEvent *event) {
    if (event->type() != QEvent::ContextMenu)
      return false;
    auto *menu = static_cast<QContextMenuEvent *>(event);
    Open(grid_->rowAt(menu->pos().y()), menu->globalPos());
    return true;
  });
  OnEvents(grid_, [this](QEvent *event) {
    if (event->type() != QEvent::ContextMenu)
      return false;
    const QModelIndex current = grid_->currentIndex();
    const QRect place = current.isValid() ? grid_->visualRect(current) : grid_->viewport()->rect();
    Open(current.isValid() ? current.row() : -1, grid_->viewport()->mapToGlobal(place.center()));
    return true;
  });
}

void SetupMenu::Open(int row, QPoint global) {
  auto *menu = new QMenu(window_);
  menu->setObjectName("FolderGridMenu");
  menu->setAttribute(Qt::WA_DeleteOnClose);
  QAction *files = menu->addAction("Files of this folder…", this, [this, row] { ShowFiles(row); });
  files->setEnabled(row >= 0 && grid_->model() && row < grid_->model()->rowCount());
  menu->addSeparator();
  AddSetupEntries(menu);
  menu->addSeparator();
  menu->addAction("Copy list of loaded folders", this, &SetupMenu::CopyLoadedNames);
  menu->popup(global);
}

void SetupMenu::AddSetupEntries(QMenu *menu) {
  menu->addAction("Save loaded folders as a setup…", this, &SetupMenu::AskSetupName);
  const std::vector<std::string> setups = selector_.Setups();
  QMenu *switchTo = menu->addMenu("Switch to setup");
  QMenu *remove = menu->addMenu("Delete setup");
  for (const std::string &name : setups) {
    switchTo->addAction(EntryText(name), this, [this, name] { Switch(name); });
    remove->addAction(EntryText(name), this, [this, name] { AskDelete(name); });
  }
  switchTo->setEnabled(!setups.empty());
  remove->setEnabled(!setups.empty());
}

void SetupMenu::ShowFiles(int row) {
  Failures failures;
  FolderFileList list = selector_.FolderFiles(row, failures);
  if (!list.folder.empty())
    OpenFolderFilesDialog(window_, std::move(list));
  ShowFailures(window_, failures, "The files could not all be looked at:");
}

void SetupMenu::AskSetupName() {
  auto *dialog = new QInputDialog(window_);
  dialog->setObjectName("SetupNameDialog");
  dialog->setAttribute(Qt::WA_DeleteOnClose);
  dialog->setWindowTitle(WindowCaptionText().simplified());
  dialog->setLabelText("Save the loaded folders, in the order they were loaded, as the setup:");
  connect(dialog, &QInputDialog::textValueSelected, this,
          [this](const QString &text) { Save(ToName(text.trimmed())); });
  dialog->open();
}

void SetupMenu::Save(const std::string &name) {
  if (!selector_.HasSetup(name)) {
    SaveNow(name);
    return;
  }
  AskThen(window_, "ConfirmReplaceSetup",
          "A setup " + Quoted(name) + " exists already. Replace it with the folders loaded now?",
          [this, name] { SaveNow(name); });
}

void SetupMenu::SaveNow(const std::string &name) {
  runner_.Run(
      VerbRunner::Input::open, [&] { return selector_.SaveSetup(name); },
      "The setup could not be saved:",
      [this](Outcome &outcome) {
        if (outcome.done)
          emit Changed();
      });
}

void SetupMenu::Switch(const std::string &name) {
  runner_.Run(
      VerbRunner::Input::blocked, [&] { return selector_.SwitchToSetup(name); },
      "The setup could not be used in full:", [this](Outcome &) { emit Changed(); });
}

void SetupMenu::AskDelete(const std::string &name) {
  AskThen(window_, "ConfirmDeleteSetup",
          "Delete the setup " + Quoted(name) +
              "? Only the list goes: no folder is loaded or unloaded.",
          [this, name] {
            runner_.Run(
                VerbRunner::Input::open, [&] { return selector_.DeleteSetup(name); },
                "The setup could not be deleted:");
          });
}

void SetupMenu::CopyLoadedNames() {
  Failures failures;
  QString text;
  for (const std::string &name : selector_.LoadedFolderNames(failures))
    text += FromName(name) + "\n";
  QGuiApplication::clipboard()->setText(text);
  ShowFailures(window_, failures, "The list of loaded folders could not be read in full:");
}
