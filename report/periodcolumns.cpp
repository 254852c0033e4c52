#include "report/periodcolumns.h"

#include "model/numbertext.h"
#include "report/columnletters.h"

#include <algorithm>

namespace penmoor {

namespace {

constexpr int kMonthsPerYear = 12;
// One year of months fills D to O, so its total column is P.
constexpr int kMonthTotalColumn = 16;

int roundedValue(const MainWindowView& view, TextBox box)
{
    return roundHalfToEven(numericValue(view.text(box)));
}

int bounded(double column)
{
    return static_cast<int>(std::clamp(column, 0.0, kLastLetteredColumn + 1.0));
}

} // namespace

PeriodSettings PeriodSettings::read(const MainWindowView& view)
{
    PeriodSettings settings;
    settings.mode = periodMode(view);
    settings.firstYear = roundedValue(view, TextBox::Text2);
    settings.lastYear = roundedValue(view, TextBox::Text3);
    settings.weeks = roundedValue(view, TextBox::Text4);
    if (settings.mode == PeriodMode::ByMonth) {
        settings.firstMonthYear = numericValue(view.text(TextBox::Text6));
        settings.lastMonthYear = numericValue(view.text(TextBox::Text7));
    }
    return settings;
}

int PeriodSettings::lastColumn() const
{
    // One column per period from D on, then the total column. Months are counted in floating
    // point, as the years they come from may have fractions.
    switch (mode) {
    case PeriodMode::ByYear:
        return bounded(static_cast<double>(lastYear) - firstYear + 1 + kFirstPeriodColumn);
    case PeriodMode::ByWeek:
        return bounded(static_cast<double>(weeks) + kFirstPeriodColumn);
    case PeriodMode::ByMonth:
        break;
    }
    return bounded(roundHalfToEven((lastMonthYear - firstMonthYear) * kMonthsPerYear + kMonthTotalColumn));
}

} // namespace penmoor
