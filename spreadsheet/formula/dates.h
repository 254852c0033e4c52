#pragma once

#include <optional>

namespace penmoor::engine {

// Dates are serial numbers of the 1900 date system: 1 is 1 January 1900, and 1900 counts as a
// leap year, so serial 60 is the phantom 29 February 1900 and 1 January 2013 is 41275.
inline constexpr int kLastDateSerial = 2958465; // 31 December 9999

struct CalendarDate {
    int year = 1900;
    int month = 1;
    int day = 1;

    bool operator==(const CalendarDate&) const = default;
};

// The serial of a date as the DATE function builds it: a year below 1900 counts from 1900,
// months and days beyond their ends carry into the next month or year (and below 1 into the
// previous one). Nothing when the year lies outside 0 to 9999 or the date outside serials 0 to
// kLastDateSerial.
std::optional<int> dateSerial(int year, int month, int day);

// The calendar date of a serial's whole part (fractions are the time of day). Serial 0 reads
// as 0 January 1900, as the application shows it. Nothing outside 0 to kLastDateSerial.
std::optional<CalendarDate> calendarDate(double serial);

} // namespace penmoor::engine
