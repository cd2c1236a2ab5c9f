#pragma once

#include "slots/slot_table.h"

#include <QColor>
#include <QTableWidget>

// Shows the slot panel's rows in `grid`: a fixed header on `headerColour`, then one row per
// plane-set folder; only the "Folder" and "Aircraft" columns are wide enough to be seen.
void FillSlotGrid(QTableWidget *grid, const SlotPanel &panel, const QColor &headerColour);
