#pragma once

#include "app/selector_state.h"

#include <QAbstractTableModel>

// Shows a FolderGrid in a table view: model row r is grid row r + 1, the header row's name cell
// is the view's column-1 header.
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
  // Marks, colours or the header text changed.
  void Changed();

private:
  const FolderGrid &grid_;
};
