#pragma once

#include "report/twelvemonthcashflow.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "tests/report/buildharness.h"

#include <memory>
#include <string>

namespace penmoor::test {

// A build against the built-in spreadsheet application, into a new workbook's active sheet.
struct SheetBuild : BuildHarness {
    std::unique_ptr<xl::Application> app = engine::BuiltinApplicationFactory().create();

    SheetBuild() { app->Workbooks()->Add(); }

    void build() { TwelveMonthCashFlow(*app, options, view).WriteCashFlowSheet(); }

    // What reading the cell's FormulaR1C1 gives: its R1C1 formula, or its constant as entered.
    std::string entry(const std::string& cell) const { return app->Range(cell)->FormulaR1C1(); }
    xl::Value value(const std::string& cell) const { return app->Range(cell)->Value(); }
};

} // namespace penmoor::test
