#include "ui/folder_grid_model.h"

#include "platform/qt_paths.h"
#include "ui/twips.h"

#include <algorithm>

#include <QFont>
#include <QHeaderView>

namespace {

// The name cell of a loaded row.
const QColor kLoadedColour(192, 255, 192);
// The mark column's text for a loaded row.
constexpr char kLoadedMark[] = "S";
// Height in twips of a shown row and of the header.
constexpr int kRowHeightTwips = 240;

} // namespace

FolderGridModel::FolderGridModel(const FolderGrid &grid, QObject *parent)
    : QAbstractTableModel(parent), grid_(grid) {}

int FolderGridModel::rowCount(const QModelIndex &parent) const {
  return parent.isValid() ? 0 : grid_.RowCount();
}

int FolderGridModel::columnCount(const QModelIndex &parent) const {
  return parent.isValid() ? 0 : 3;
}

QVariant FolderGridModel::data(const QModelIndex &index, int role) const {
  if (!index.isValid())
    return {};
  const GridRow &row = grid_.Row(index.row());
  if (role == Qt::DisplayRole) {
    switch (index.column()) {
    case 0:
      return FromPath(grid_.PathOf(index.row()));
    case 1:
      return FromName(row.name);
    default:
      return IsLoaded(row) ? QString(kLoadedMark) : QString();
    }
  }
  if (index.column() != 1)
    return {};
  if (role == Qt::BackgroundRole && IsLoaded(row))
    return kLoadedColour;
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
  return section == 1 ? FromName(grid_.rule) : QString();
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

void FolderGridModel::ShowRows(QTableView &view) const {
  // Asking the view about each row costs more than the rows' own flags: a view that hides no row
  // while every row is shown is left alone.
  const bool allShown = std::all_of(grid_.rows.begin(), grid_.rows.end(),
                                    [](const GridRow &row) { return row.shown; });
  if (allShown && view.verticalHeader()->hiddenSectionCount() == 0)
    return;
  for (int row = 0; row < grid_.RowCount(); ++row)
    if (view.isRowHidden(row) == grid_.Row(row).shown)
      view.setRowHidden(row, !grid_.Row(row).shown);
}

int FolderGridModel::ViewHeight() const {
  return TwipsToPixels(kRowHeightTwips * (std::min(grid_.RowCount(), 19) + 1) + 72);
}
