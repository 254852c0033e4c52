#include "spreadsheet/formula/cellentry.h"

#include "spreadsheet/formula/dates.h"
#include "spreadsheet/formula/r1c1parser.h"
#include "spreadsheet/formula/r1c1printer.h"
#include "spreadsheet/formula/valuetext.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>

namespace penmoor::engine {

namespace {

bool isGeneral(std::string_view format)
{
    return equalsIgnoringCase(format, "General");
}

// Calls visit(c) for each character of a number format that is a format code, passing over
// quoted text, escaped characters and [bracketed] parts such as colours.
template <class Visit> void forEachCode(std::string_view format, Visit&& visit)
{
    for (std::size_t i = 0; i < format.size(); ++i) {
        const char c = format[i];
        if (c == '"') {
            i = std::min(format.find('"', i + 1), format.size());
        } else if (c == '[') {
            i = std::min(format.find(']', i + 1), format.size());
        } else if (c == '\\' || c == '_' || c == '*') {
            ++i; // the next character is shown as it is, or sets padding
        } else {
            visit(c);
        }
    }
}

bool showsPercent(std::string_view format)
{
    bool percent = false;
    forEachCode(format, [&](char c) { percent = percent || c == '%'; });
    return percent;
}

std::optional<std::string> impliedFormat(const ParsedNumber& number, std::string_view currentFormat)
{
    if (number.form == NumberForm::Date)
        return isDateFormat(currentFormat) ? std::nullopt : std::optional<std::string>("m/d/yyyy");
    if (!isGeneral(currentFormat))
        return std::nullopt;
    switch (number.form) {
    case NumberForm::Grouped:
        return number.hasFraction ? "#,##0.00" : "#,##0";
    case NumberForm::Percent:
        return number.hasFraction ? "0.00%" : "0%";
    case NumberForm::Scientific:
        return "0.00E+00";
    default:
        return std::nullopt;
    }
}

std::string dateText(double serial)
{
    const std::optional<CalendarDate> date = calendarDate(serial);
    if (!date || serial != static_cast<double>(static_cast<long long>(serial)) || date->day == 0)
        return numberText(serial);
    return std::to_string(date->month) + "/" + std::to_string(date->day) + "/" + std::to_string(date->year);
}

} // namespace

bool isDateFormat(std::string_view format)
{
    if (isGeneral(format))
        return false;
    bool date = false;
    forEachCode(format, [&](char c) {
        const char code = toAsciiUpper(c);
        date = date || code == 'D' || code == 'M' || code == 'Y' || code == 'H' || code == 'S';
    });
    return date;
}

EnteredContent parseCellEntry(std::string_view text, std::string_view currentFormat)
{
    if (text.empty())
        return { std::monostate {}, std::nullopt };
    if (text.front() == '\'')
        return { std::string(text.substr(1)), std::nullopt };
    if (text.front() == '=')
        return { Formula { parseFormulaR1C1(text), {} }, std::nullopt };
    if (equalsIgnoringCase(text, "TRUE") || equalsIgnoringCase(text, "FALSE"))
        return { equalsIgnoringCase(text, "TRUE"), std::nullopt };
    if (const std::optional<xl::ErrorValue> error = parseErrorText(text))
        return { *error, std::nullopt };
    if (const std::optional<ParsedNumber> number = parseNumberText(text))
        return { number->value, impliedFormat(*number, currentFormat) };
    return { std::string(text), std::nullopt };
}

std::string entryText(const CellContent& content, std::string_view numberFormat)
{
    if (const Formula* formula = std::get_if<Formula>(&content))
        return formatFormulaR1C1(formula->tokens);
    if (const double* number = std::get_if<double>(&content)) {
        if (isDateFormat(numberFormat))
            return dateText(*number);
        if (showsPercent(numberFormat))
            return numberText(*number * 100.0) + "%";
        return numberText(*number);
    }
    if (const std::string* text = std::get_if<std::string>(&content))
        return *text;
    if (const bool* flag = std::get_if<bool>(&content))
        return *flag ? "TRUE" : "FALSE";
    if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&content))
        return std::string(errorText(*error));
    return std::string();
}

} // namespace penmoor::engine
