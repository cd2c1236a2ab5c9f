#include "ui/folder_grid_model.h"

#include "platform/qt_paths.h"
#include "ui/twips.h"

#include <QFont>

FolderGridModel::FolderGridModel(const FolderGrid &grid, QObject *parent)
    : QAbstractTableModel(parent), grid_(grid) {}

int FolderGridModel::rowCount(const QModelIndex &parent) const {
  return parent.isValid() ? 0 : grid_.RowCount() - 1;
}

int FolderGridModel::columnCount(const QModelIndex &parent) const {
  return parent.isValid() ? 0 : 3;
}

QVariant FolderGridModel::data(const QModelIndex &index, int role) const {
  if (!index.isValid())
    return {};
  const GridRow &row = grid_.rows[static_cast<size_t>(index.row() + 1)];
  if (role == Qt::DisplayRole) {
    switch (index.column()) {
    case 0:
      return FromPath(grid_.PathOf(index.row() + 1));
    case 1:
      return FromName(row.name);
    default:
      return QString::fromStdString(row.mark);
    }
  }
  if (index.column() != 1)
    return {};
  if (role == Qt::BackgroundRole && row.nameColour != 0)
    return FromOle(row.nameColour);
  // A name too long for its column is read whole in the tooltip.
  if (role == Qt::ToolTipRole)
    return FromName(row.name);
  // Loaded rows are bold as well as green: pale green is hard to tell from white on many screens.
  if (role == Qt::FontRole && IsLoaded(row)) {
    QFont bold;
    bold.setBold(true);
    return bold;
  }
  return {};
}

QVariant FolderGridModel::headerData(int section, Qt::Orientation orientation, int role) const {
  if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
    return {};
  return section == 1 ? FromName(grid_.rows[0].name) : QString();
}

void FolderGridModel::Rebuilt() {
  beginResetModel();
  endResetModel();
}

void FolderGridModel::Changed() {
  if (rowCount() > 0)
    emit dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
  emit headerDataChanged(Qt::Horizontal, 1, 1);
}
