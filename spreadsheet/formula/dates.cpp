#include "spreadsheet/formula/dates.h"

#include <cmath>

namespace penmoor::engine {

namespace {

// Days from 1 January 1970 to a proleptic Gregorian date (any month, day 1..31).
long long daysFromCivil(long long year, int month, int day)
{
    year -= month <= 2 ? 1 : 0;
    const long long era = (year >= 0 ? year : year - 399) / 400;
    const long long yearOfEra = year - era * 400;
    const int shiftedMonth = month > 2 ? month - 3 : month + 9; // March is month 0
    const long long dayOfYear = (153 * shiftedMonth + 2) / 5 + day - 1;
    const long long dayOfEra = yearOfEra * 365 + yearOfEra / 4 - yearOfEra / 100 + dayOfYear;
    return era * 146097 + dayOfEra - 719468;
}

CalendarDate civilFromDays(long long days)
{
    days += 719468;
    const long long era = (days >= 0 ? days : days - 146096) / 146097;
    const long long dayOfEra = days - era * 146097;
    const long long yearOfEra = (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const long long dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const long long shiftedMonth = (5 * dayOfYear + 2) / 153;
    const int day = static_cast<int>(dayOfYear - (153 * shiftedMonth + 2) / 5 + 1);
    const int month = static_cast<int>(shiftedMonth < 10 ? shiftedMonth + 3 : shiftedMonth - 9);
    const long long year = yearOfEra + era * 400 + (month <= 2 ? 1 : 0);
    return { static_cast<int>(year), month, day };
}

// Serials count from 30 December 1899 from 1 March 1900 on; before that they are one less,
// because the phantom 29 February 1900 sits between.
const long long kEpoch = daysFromCivil(1899, 12, 30);
const long long kFirstOfMarch1900 = daysFromCivil(1900, 3, 1);

// The serial of the first day of a month; January and February 1900 take the phantom day into
// account, so that day 29 of February 1900 lands on serial 60.
long long firstOfMonthSerial(long long year, int month)
{
    const long long days = daysFromCivil(year, month, 1);
    return days >= kFirstOfMarch1900 ? days - kEpoch : days - kEpoch - 1;
}

} // namespace

std::optional<int> dateSerial(int year, int month, int day)
{
    if (year < 0 || year > 9999)
        return std::nullopt;
    long long fullYear = year < 1900 ? year + 1900 : year;
    // Carry whole years out of the month, rounding towards the earlier year.
    const long long monthIndex = static_cast<long long>(month) - 1;
    const long long carry = monthIndex >= 0 ? monthIndex / 12 : (monthIndex - 11) / 12;
    fullYear += carry;
    const int normalisedMonth = static_cast<int>(monthIndex - carry * 12) + 1;
    if (fullYear < 1899 || fullYear > 10000)
        return std::nullopt;
    const long long serial = firstOfMonthSerial(fullYear, normalisedMonth) + day - 1;
    if (serial < 0 || serial > kLastDateSerial)
        return std::nullopt;
    return static_cast<int>(serial);
}

std::optional<CalendarDate> calendarDate(double serial)
{
    if (!(serial >= 0.0) || serial >= kLastDateSerial + 1.0)
        return std::nullopt;
    const auto whole = static_cast<long long>(std::floor(serial));
    if (whole == 0)
        return CalendarDate { 1900, 1, 0 };
    if (whole == 60)
        return CalendarDate { 1900, 2, 29 };
    return civilFromDays(kEpoch + whole + (whole < 60 ? 1 : 0));
}

} // namespace penmoor::engine
