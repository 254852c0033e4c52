#pragma once

#include "automation/contract/application.h"
#include "model/mainwindowview.h"
#include "model/options.h"

namespace penmoor {

// The cash-flow sheet builder. Constructed for one build with the spreadsheet application of
// that build, the program's item list and the main window (or its headless stand-in), all of
// which must outlive it:
//
//     TwelveMonthCashFlow(application, options, view).WriteCashFlowSheet();
class TwelveMonthCashFlow {
public:
    TwelveMonthCashFlow(xl::Application& application, Options& options, const MainWindowView& view);

    // Writes the whole cash-flow sheet into the active sheet of the application's active
    // workbook: palette, an emptied Arial sheet, sizes, title block, period header, the table
    // frame, one row per item with the totals' formulas, and a one-page landscape A4 page setup;
    // leaves C5 selected. Reads the period options and the company name from the view when it
    // starts; marks every item included and gives each its sheet row.
    //
    // It has no error handling of its own: the first failure (xl::Error from the application,
    // or an item list whose totals name no item) ends it and reaches the caller, with what was
    // written so far left on the sheet.
    void WriteCashFlowSheet();

private:
    xl::Application& m_application;
    Options& m_options;
    const MainWindowView& m_view;
};

} // namespace penmoor
