#pragma once

#include "model/mainwindowview.h"
#include "shell/dialogs.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace penmoor {

// The checks of the main window's year and week boxes. Each one corrects the box in place,
// tells the user about every correction in a box titled "Error", and returns true when it
// reported a problem. The decisions are plain functions so that they can be tested as tables.

// The earliest year a plan may start in; two-digit years count from 2000.
inline constexpr int kEarliestYear = 1970;
inline constexpr int kFewestWeeks = 1;
inline constexpr int kMostWeeks = 100;
// How many years a plan may span: a month column per month keeps By Month to ten years.
inline constexpr int kMonthModeYearSpan = 10;
inline constexpr int kYearModeYearSpan = 100;

// What a check makes of a box: the value to write back and, when it had to correct the
// value, the message that says so.
struct CheckedValue {
    std::int64_t value = 0;
    std::optional<std::string> problem;
};

// A year box: its whole number (halves to even; no number counts as 0), below 100 taken as
// 2000 + that, and below 1970 replaced by the current year.
CheckedValue checkYear(std::string_view text, int currentYear);

// The weeks box: its whole number, kept between 1 and 100.
CheckedValue checkWeeks(std::string_view text);

// The end year of a pair, checked against the start year: not before it, and no further from
// it than the mode's span; either problem sets the end year to the start year. The week mode
// checks nothing and gives the end box's whole number back.
CheckedValue checkYearPair(PeriodMode mode, std::string_view startText, std::string_view endText);

// The pair of year boxes a mode builds from: Text6 and Text7 in By Month, Text2 and Text3
// otherwise (By Week has no years of its own; its check leaves them unchecked).
struct YearPair {
    TextBox start;
    TextBox end;
};
YearPair yearPairOf(PeriodMode mode);

// The checks on the window: each writes the checked value back into its box as decimal text,
// shows the problem when there is one, and returns whether it did.
bool ValidateYear(MainWindowView& view, TextBox box, Dialogs& dialogs, int currentYear);
bool ValidateWeeks(MainWindowView& view, TextBox box, Dialogs& dialogs);
// The check before a build: the year pair of the selected mode.
bool CheckPeriodOptions(MainWindowView& view, Dialogs& dialogs);

} // namespace penmoor
