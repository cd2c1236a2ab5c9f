#pragma once

#include "app/selector.h"
#include "ui/verb_runner.h"

#include <QObject>
#include <QPoint>
#include <QString>
#include <QTableView>
#include <string>

class QMenu;

// The folder grid's context menu (right-click, or the menu key on the current row): the files of
// the row's folder, saving, switching to and deleting setups, and copying the list of loaded
// folders. Each entry calls a Selector verb and tells the player the outcome.
class SetupMenu : public QObject {
  Q_OBJECT
public:
  // Verbs run through `runner`, which shows their outcome.
  SetupMenu(Selector &selector, VerbRunner &runner, QTableView *grid, QWidget *window);

signals:
  // The loaded folders may have changed: the window draws the grid again.
  void Changed();

private:
  void Open(int row, QPoint global);
  void AddSetupEntries(QMenu *menu);
  void ShowFiles(int row);
  void AskSetupName();
  void Save(const std::string &name);
  void SaveNow(const std::string &name);
  void Switch(const std::string &name);
  void AskDelete(const std::string &name);
  void CopyLoadedNames();

  Selector &selector_;
  VerbRunner &runner_;
  QTableView *grid_;
  QWidget *window_;
};
