#include "ui/slot_grid_view.h"

#include "platform/qt_paths.h"
#include "ui/twips.h"

#include <array>

namespace {

const std::array<const char *, kSlotColumns> kHeaders = {"Folder", "PlnSlot", "SkinSlot",
                                                         "Aircraft", ""};
// Width of each column; 0 hides it.
const std::array<int, kSlotColumns> kWidthsTwips = {2000, 0, 0, 2000, 0};

// A name too long for its column is read whole in the tooltip, as in the folder grid.
void SetCell(QTableWidget *grid, int row, int column, const QString &text) {
  auto *item = new QTableWidgetItem(text);
  item->setToolTip(text);
  grid->setItem(row, column, item);
}

} // namespace

void FillSlotGrid(QTableWidget *grid, const SlotPanel &panel, const QColor &headerColour) {
  const int columns = kSlotColumns;
  grid->clear();
  grid->setColumnCount(columns);
  grid->setRowCount(static_cast<int>(panel.rows.size()));
  // The header is the view's own, so that it stays in view while the rows scroll.
  for (int column = 0; column < columns; ++column) {
    auto *header = new QTableWidgetItem(kHeaders[static_cast<size_t>(column)]);
    header->setBackground(headerColour);
    grid->setHorizontalHeaderItem(column, header);
    const int width = kWidthsTwips[static_cast<size_t>(column)];
    grid->setColumnHidden(column, width == 0);
    if (width > 0)
      grid->setColumnWidth(column, TwipsToPixels(width));
  }
  int row = 0;
  for (const SlotRow &slot : panel.rows) {
    SetCell(grid, row, 0, FromName(slot.folder));
    SetCell(grid, row, 1, FromName(slot.plnSlot));
    SetCell(grid, row, 2, FromName(slot.skinSlot));
    SetCell(grid, row, 3, FromName(slot.aircraft));
    ++row;
  }
}
