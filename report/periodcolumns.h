#pragma once

#include "model/mainwindowview.h"
#include "report/sheetlayout.h"

namespace penmoor {

// The period options of the main window as the builder reads them when it starts.
struct PeriodSettings {
    PeriodMode mode = PeriodMode::ByMonth;
    int firstYear = 0; // By Year: Text2, rounded
    int lastYear = 0; // By Year: Text3, rounded
    int weeks = 0; // By Week: Text4, rounded
    double firstMonthYear = 0; // By Month: Text6, read only in that mode
    double lastMonthYear = 0; // By Month: Text7, read only in that mode

    static PeriodSettings read(const MainWindowView& view);

    // The number of the total column, which follows the last period column. Unchecked: a span
    // wider than the sheet gives a column that the application rejects. Below 1 and beyond the
    // last column with letters every column is rejected alike, so the result is kept within
    // 0 to kLastLetteredColumn + 1, which keeps all arithmetic on columns from overflowing.
    int lastColumn() const;
};

} // namespace penmoor
