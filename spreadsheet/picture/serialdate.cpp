#include "spreadsheet/picture/serialdate.h"

#include <cmath>

namespace penmoor::picture {

namespace {

constexpr double kLastSerial = 2958465.0; // 31 December 9999
constexpr long long kSecondsPerDay = 86400;
constexpr int kLeapDaySerial = 60;

struct CivilDate {
    int year;
    int month;
    int day;
};

// The civil date of a count of days since 1 January 1970 (proleptic Gregorian calendar).
CivilDate civilFromDays(long long days)
{
    days += 719468; // days from 1 March of year 0 to 1 January 1970
    const long long era = (days >= 0 ? days : days - 146096) / 146097;
    const long long dayOfEra = days - era * 146097;
    const long long yearOfEra = (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const long long dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const long long shiftedMonth = (5 * dayOfYear + 2) / 153; // 0 = March
    const int day = static_cast<int>(dayOfYear - (153 * shiftedMonth + 2) / 5 + 1);
    const int month = static_cast<int>(shiftedMonth < 10 ? shiftedMonth + 3 : shiftedMonth - 9);
    const long long year = yearOfEra + era * 400 + (month <= 2 ? 1 : 0);
    return { static_cast<int>(year), month, day };
}

CivilDate dateOfSerialDay(long long serialDay)
{
    if (serialDay == 0) {
        return { 1900, 1, 0 };
    }
    if (serialDay < kLeapDaySerial) {
        return serialDay <= 31 ? CivilDate { 1900, 1, static_cast<int>(serialDay) }
                               : CivilDate { 1900, 2, static_cast<int>(serialDay - 31) };
    }
    if (serialDay == kLeapDaySerial) {
        return { 1900, 2, 29 };
    }
    // From 1 March 1900 on, serial n is n days after 30 December 1899, which is 25569 days
    // before 1 January 1970.
    return civilFromDays(serialDay - 25569);
}

} // namespace

std::optional<DateTimeParts> splitSerial(double serial, int subsecondDigits)
{
    if (!std::isfinite(serial) || serial < 0.0 || serial >= kLastSerial + 1.0) {
        return std::nullopt;
    }
    long long unitsPerSecond = 1;
    for (int i = 0; i < subsecondDigits; ++i) {
        unitsPerSecond *= 10;
    }
    const long long unitsPerDay = kSecondsPerDay * unitsPerSecond;
    const auto units = static_cast<long long>(std::llround(serial * static_cast<double>(unitsPerDay)));
    const long long serialDay = units / unitsPerDay;
    if (static_cast<double>(serialDay) > kLastSerial) {
        return std::nullopt;
    }
    long long rest = units % unitsPerDay;

    DateTimeParts parts;
    const CivilDate date = dateOfSerialDay(serialDay);
    parts.year = date.year;
    parts.month = date.month;
    parts.day = date.day;
    parts.weekday = static_cast<int>((serialDay + 6) % 7);
    parts.wholeDays = serialDay;
    parts.subsecond = static_cast<int>(rest % unitsPerSecond);
    rest /= unitsPerSecond;
    parts.second = static_cast<int>(rest % 60);
    rest /= 60;
    parts.minute = static_cast<int>(rest % 60);
    parts.hour = static_cast<int>(rest / 60);
    return parts;
}

} // namespace penmoor::picture
