#pragma once

#include "spreadsheet/workbook/workbook.h"

#include <string>

namespace penmoor::xls {

// Saves the workbook as an .xls file at exactly this path (UTF-8). The new file is written
// next to it under a temporary name and moved into place only once complete, so a failure
// never leaves a half-written workbook and an existing file survives it. Formula results must
// be current. Raises xl::Error with the system's reason (folder missing, no permission, disk
// full) or the format's (more formats than a file can hold).
void saveXlsFile(const engine::Workbook& workbook, const std::string& path);

// Opens an .xls file. Raises xl::Error with the system's reason when the file cannot be read,
// and "<path> is not a readable .xls workbook: <reason>." when its content is not one.
engine::Workbook openXlsFile(const std::string& path);

} // namespace penmoor::xls
