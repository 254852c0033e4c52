// Feeds arbitrary text to the R1C1 formula parser. A malformed formula must be refused with
// xl::Error and nothing else; an accepted one must print in a form that parses back to the
// same printed form, and must evaluate, wherever it sits, without failing.
#include "automation/contract/error.h"
#include "spreadsheet/formula/r1c1parser.h"
#include "spreadsheet/formula/r1c1printer.h"
#include "spreadsheet/formula/recalculation.h"
#include "spreadsheet/workbook/sheet.h"

#include <cstdint>
#include <cstdlib>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace penmoor::engine;
    std::string formula(reinterpret_cast<const char*>(data), size);
    if (formula.empty() || formula.front() != '=')
        formula.insert(formula.begin(), '=');

    TokenArray tokens;
    try {
        tokens = parseFormulaR1C1(formula);
    } catch (const xl::Error&) {
        return 0;
    }

    const std::string printed = formatFormulaR1C1(tokens);
    if (printed.size() <= kMaxFormulaLength && formatFormulaR1C1(parseFormulaR1C1(printed)) != printed)
        std::abort();

    // The formula at the sheet's corners and among a few values, twice so that it reaches itself.
    Sheet sheet("Fuzz", 1);
    sheet.setContent({ 1, 2 }, 2.0);
    sheet.setContent({ 2, 1 }, std::string("text"));
    sheet.setContent({ 2, 3 }, xl::ErrorValue::Div0);
    for (const CellPosition cell : { CellPosition { 1, 1 }, CellPosition { 2, 2 }, CellPosition { 3, 256 } })
        sheet.setContent(cell, Formula { tokens, {} });
    recalculate(sheet);
    return 0;
}
