#pragma once

#include <string>
#include <vector>

namespace penmoor::picture {

// The texts a number may show in the General format, best first. The spreadsheet application
// shows at most 11 characters (a minus sign not counted), with as many decimals as fit and
// without trailing zeros; numbers of 12 or more integer digits, and those below 0.0001, take the
// scientific form "1.23457E+11". When the cell is too narrow the application drops decimals, then
// falls back to shorter scientific forms; the caller shows the first text that fits its cell.
std::vector<std::string> generalNumberForms(double value);

} // namespace penmoor::picture
