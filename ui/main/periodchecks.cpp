#include "ui/main/periodchecks.h"

#include "model/numbertext.h"

namespace penmoor {

namespace {

constexpr std::string_view kChangeYear = "\r\nPlease change year to necessary value.";
constexpr std::string_view kChangeWeeks = "\r\nPlease change week's number to necessary value.";

std::int64_t wholeNumber(std::string_view text)
{
    return roundHalfToEven(numericValue(text));
}

std::string_view modeName(PeriodMode mode)
{
    switch (mode) {
    case PeriodMode::ByMonth:
        return "Month mode";
    case PeriodMode::ByYear:
        return "Year mode";
    case PeriodMode::ByWeek:
        break;
    }
    return "Week mode";
}

// Shows the problem, if any, and writes the value back in every case.
bool settle(MainWindowView& view, TextBox box, Dialogs& dialogs, const CheckedValue& checked)
{
    if (checked.problem) {
        dialogs.showMessage(MessageRequest::inputProblem(*checked.problem));
    }
    view.setText(box, std::to_string(checked.value));
    return checked.problem.has_value();
}

} // namespace

CheckedValue checkYear(std::string_view text, int currentYear)
{
    std::int64_t year = wholeNumber(text);
    if (year < 100) {
        year += 2000;
    }
    if (year < kEarliestYear) {
        return { currentYear, "Year can't be less then 1970." + std::string(kChangeYear) };
    }
    return { year, std::nullopt };
}

CheckedValue checkWeeks(std::string_view text)
{
    const std::int64_t weeks = wholeNumber(text);
    if (weeks < kFewestWeeks) {
        return { kFewestWeeks, "Week number can't be less then 1." + std::string(kChangeWeeks) };
    }
    if (weeks > kMostWeeks) {
        return { kMostWeeks, "Week number can't be greater then 100." + std::string(kChangeWeeks) };
    }
    return { weeks, std::nullopt };
}

CheckedValue checkYearPair(PeriodMode mode, std::string_view startText, std::string_view endText)
{
    const std::int64_t start = wholeNumber(startText);
    const std::int64_t end = wholeNumber(endText);
    if (mode == PeriodMode::ByWeek) {
        return { end, std::nullopt };
    }
    if (start > end) {
        return { start, "Start year can't be greater then end year." + std::string(kChangeYear) };
    }
    const int span = mode == PeriodMode::ByMonth ? kMonthModeYearSpan : kYearModeYearSpan;
    if (end - start > span) {
        return { start,
            "Start year can't be greater then end year by more then " + std::to_string(span) + " years in "
                + std::string(modeName(mode)) + "." + std::string(kChangeYear) };
    }
    return { end, std::nullopt };
}

YearPair yearPairOf(PeriodMode mode)
{
    if (mode == PeriodMode::ByMonth) {
        return { TextBox::Text6, TextBox::Text7 };
    }
    return { TextBox::Text2, TextBox::Text3 };
}

bool ValidateYear(MainWindowView& view, TextBox box, Dialogs& dialogs, int currentYear)
{
    return settle(view, box, dialogs, checkYear(view.text(box), currentYear));
}

bool ValidateWeeks(MainWindowView& view, TextBox box, Dialogs& dialogs)
{
    return settle(view, box, dialogs, checkWeeks(view.text(box)));
}

bool CheckPeriodOptions(MainWindowView& view, Dialogs& dialogs)
{
    const PeriodMode mode = periodMode(view);
    const YearPair pair = yearPairOf(mode);
    return settle(view, pair.end, dialogs, checkYearPair(mode, view.text(pair.start), view.text(pair.end)));
}

} // namespace penmoor
