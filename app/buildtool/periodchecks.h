#pragma once

#include "model/mainwindowview.h"

#include <string_view>

namespace penmoor {

// The years and weeks of penmoor-build, checked as the main window checks them but refused
// with UsageError instead of corrected. option names the option in the message.

// A whole number of digits; 0 to 99 stand for 2000 to 2099, as the window reads 13 as 2013.
// The year must lie between 1970 and 9999, the last year a workbook date can have.
int checkedYear(std::string_view text, std::string_view option);

// The last year may not come before the first, nor more than 100 years after it, or 10 in
// By Month (whose columns are months).
void checkYearSpan(int firstYear, int lastYear, PeriodMode mode, std::string_view option);

// A whole number of weeks from 1 to 100.
int checkedWeeks(std::string_view text, std::string_view option);

} // namespace penmoor
