#pragma once

#include <optional>

namespace penmoor::picture {

// A date-time serial number of the 1900 date system split into what date and time formats show.
// Serial 1 is 1 January 1900 and, as in the spreadsheet application, serial 60 is the
// nonexistent 29 February 1900; serial 0 shows as 0 January 1900.
struct DateTimeParts {
    int year = 1900;
    int month = 1; // 1 to 12
    int day = 0; // 0 to 31
    int weekday = 0; // 0 Sunday to 6 Saturday
    int hour = 0;
    int minute = 0;
    int second = 0;
    int subsecond = 0; // in units of 10^-subsecondDigits seconds
    long long wholeDays = 0; // for elapsed hours, minutes and seconds
};

// The serial rounded to the shown precision (whole seconds, or 1 to 3 decimals of a second).
// No value for serials the application cannot show as a date: negative or after 31 December 9999.
std::optional<DateTimeParts> splitSerial(double serial, int subsecondDigits);

} // namespace penmoor::picture
