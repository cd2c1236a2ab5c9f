#pragma once

#include "app/selector_state.h"

#include <QAbstractTableModel>
#include <QTableView>

// Shows a FolderGrid in a table view, row for row: column 0 the path, 1 the name, 2 the mark "S"
// of a loaded row, whose name is light green and bold; the grid's rule text is column 1's header.
// The one place that turns the rows' flags into what the player sees.
class FolderGridModel : public QAbstractTableModel {
  Q_OBJECT
public:
  explicit FolderGridModel(const FolderGrid &grid, QObject *parent = nullptr);

  int rowCount(const QModelIndex &parent = {}) const override;
  int columnCount(const QModelIndex &parent = {}) const override;
  QVariant data(const QModelIndex &index, int role) const override;
  QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

  // The grid's rows were replaced.
  void Rebuilt();
  // Marks or the rule text changed.
  void Changed();
  // Hides the rows the shown category does not hold and shows the others.
  void ShowRows(QTableView &view) const;
  // The view's height for the grid's rows, in pixels: at most 20 rows besides the header.
  int ViewHeight() const;

private:
  const FolderGrid &grid_;
};
