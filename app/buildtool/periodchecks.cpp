#include "app/buildtool/periodchecks.h"

#include "app/buildtool/buildrequest.h"

#include <optional>
#include <string>

namespace penmoor {

namespace {

constexpr int kEarliestYear = 1970;
constexpr int kLatestYear = 9999;
constexpr int kCenturyYears = 100;
constexpr int kMaximumYearSpan = 100;
constexpr int kMaximumMonthSpan = 10;
constexpr int kMaximumWeeks = 100;

// Digits only, at most nine of them, so the value always fits.
std::optional<int> wholeNumber(std::string_view text)
{
    if (text.empty() || text.size() > 9) {
        return std::nullopt;
    }
    int value = 0;
    for (const char c : text) {
        if (c < '0' || c > '9') {
            return std::nullopt;
        }
        value = value * 10 + (c - '0');
    }
    return value;
}

} // namespace

int checkedYear(std::string_view text, std::string_view option)
{
    const std::optional<int> number = wholeNumber(text);
    if (!number) {
        throw UsageError(std::string(option) + ": " + inQuotes(text) + " is not a year (a whole number such as 2013).");
    }
    const int year = *number < kCenturyYears ? *number + 2000 : *number;
    if (year < kEarliestYear) {
        throw UsageError(std::string(option) + ": the year " + std::to_string(year) + " is before 1970.");
    }
    if (year > kLatestYear) {
        throw UsageError(std::string(option) + ": the year " + std::to_string(year) + " is after 9999.");
    }
    return year;
}

void checkYearSpan(int firstYear, int lastYear, PeriodMode mode, std::string_view option)
{
    if (firstYear > lastYear) {
        throw UsageError(std::string(option) + ": the first year " + std::to_string(firstYear)
            + " is after the last year " + std::to_string(lastYear) + ".");
    }
    const int limit = mode == PeriodMode::ByMonth ? kMaximumMonthSpan : kMaximumYearSpan;
    if (lastYear - firstYear > limit) {
        throw UsageError(std::string(option) + ": the last year may be at most " + std::to_string(limit)
            + " years after the first, but " + std::to_string(lastYear) + " is " + std::to_string(lastYear - firstYear)
            + " years after " + std::to_string(firstYear) + ".");
    }
}

int checkedWeeks(std::string_view text, std::string_view option)
{
    const std::optional<int> weeks = wholeNumber(text);
    if (!weeks || *weeks < 1 || *weeks > kMaximumWeeks) {
        throw UsageError(std::string(option) + ": " + inQuotes(text) + " is not a number of weeks from 1 to 100.");
    }
    return *weeks;
}

} // namespace penmoor
