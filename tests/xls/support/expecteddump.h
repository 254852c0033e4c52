#pragma once

#include "spreadsheet/workbook/workbook.h"

#include <string>
#include <vector>

namespace penmoor::xls::test {

// What tests/xls/interop/xlrd_dump.py must print for a file holding this workbook, worked out
// from the model's own meaning (palette colours, effective formats, sizes in the units the
// format documents), not from the writer's records.
std::vector<std::string> expectedXlrdDump(const engine::Workbook& workbook);

// Lines of `actual` missing from `expected` and the other way round, for a readable failure.
std::string lineDifferences(const std::vector<std::string>& expected, const std::vector<std::string>& actual);

} // namespace penmoor::xls::test
