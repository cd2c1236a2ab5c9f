#include "ui/folder_files_model.h"

#include "base/names.h"
#include "platform/qt_paths.h"

#include <algorithm>
#include <numeric>

namespace {

enum Column { kName, kPlace, kState, kAlsoIn, kColumns };

const char *const kHeaders[kColumns] = {"File", "Goes to", "State", "Also in"};

} // namespace

FolderFilesModel::FolderFilesModel(FolderFileList list, QObject *parent)
    : QAbstractTableModel(parent), list_(std::move(list)), order_(list_.files.size()) {
  std::iota(order_.begin(), order_.end(), size_t{0});
}

int FolderFilesModel::rowCount(const QModelIndex &parent) const {
  return parent.isValid() ? 0 : static_cast<int>(order_.size());
}

int FolderFilesModel::columnCount(const QModelIndex &parent) const {
  return parent.isValid() ? 0 : kColumns;
}

std::string FolderFilesModel::Text(size_t file, int column) const {
  const FolderFile &row = list_.files[file];
  switch (column) {
  case kName:
    return row.name;
  case kPlace:
    return PlaceText(row.place);
  case kState:
    return FileStateText(row);
  default:
    break;
  }
  std::string folders;
  for (const std::string &folder : row.alsoIn)
    folders += (folders.empty() ? "" : ", ") + folder;
  return folders;
}

QVariant FolderFilesModel::data(const QModelIndex &index, int role) const {
  if (!index.isValid() || index.row() >= rowCount() || index.column() >= kColumns)
    return {};
  if (role != Qt::DisplayRole && role != Qt::ToolTipRole)
    return {};
  return FromName(Text(order_[static_cast<size_t>(index.row())], index.column()));
}

QVariant FolderFilesModel::headerData(int section, Qt::Orientation orientation, int role) const {
  if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 ||
      section >= kColumns)
    return {};
  return QString(kHeaders[section]);
}

void FolderFilesModel::sort(int column, Qt::SortOrder order) {
  if (column < 0 || column >= kColumns)
    return;
  emit layoutAboutToBeChanged({}, QAbstractItemModel::VerticalSortHint);
  const QModelIndexList before = persistentIndexList();
  const std::vector<size_t> shownBefore = order_;
  std::vector<size_t> shownAt(order_.size());
  std::vector<std::string> keys(list_.files.size());
  for (size_t file = 0; file < keys.size(); ++file)
    keys[file] = Text(file, column);
  // Ties keep name order, so that sorting by state lists each state's files by name.
  std::sort(order_.begin(), order_.end(), [&](size_t a, size_t b) {
    if (keys[a] != keys[b])
      return order == Qt::AscendingOrder ? NameLess(keys[a], keys[b]) : NameLess(keys[b], keys[a]);
    return NameLess(list_.files[a].name, list_.files[b].name);
  });
  for (size_t row = 0; row < order_.size(); ++row)
    shownAt[order_[row]] = row;
  QModelIndexList after;
  for (const QModelIndex &index : before)
    after << this->index(static_cast<int>(shownAt[shownBefore[static_cast<size_t>(index.row())]]),
                         index.column());
  changePersistentIndexList(before, after);
  emit layoutChanged({}, QAbstractItemModel::VerticalSortHint);
}
