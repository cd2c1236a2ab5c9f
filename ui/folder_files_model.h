#pragma once

#include "app/selector.h"

#include <QAbstractTableModel>
#include <vector>

// The files of one add-on folder in a table: name, where it goes, its state now, and the other
// folders that provide the same name. Sorts by any column.
class FolderFilesModel : public QAbstractTableModel {
  Q_OBJECT
public:
  explicit FolderFilesModel(FolderFileList list, QObject *parent = nullptr);

  int rowCount(const QModelIndex &parent = {}) const override;
  int columnCount(const QModelIndex &parent = {}) const override;
  QVariant data(const QModelIndex &index, int role) const override;
  QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
  void sort(int column, Qt::SortOrder order) override;

  const FolderFileList &List() const { return list_; }

private:
  std::string Text(size_t file, int column) const;

  FolderFileList list_;
  std::vector<size_t> order_; // row r shows list_.files[order_[r]]
};
