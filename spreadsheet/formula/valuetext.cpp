#include "spreadsheet/formula/valuetext.h"

#include "spreadsheet/formula/dates.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace penmoor::engine {

namespace {

constexpr std::array<std::pair<xl::ErrorValue, std::string_view>, 7> kErrorTexts { {
    { xl::ErrorValue::Null, "#NULL!" },
    { xl::ErrorValue::Div0, "#DIV/0!" },
    { xl::ErrorValue::Value, "#VALUE!" },
    { xl::ErrorValue::Ref, "#REF!" },
    { xl::ErrorValue::Name, "#NAME?" },
    { xl::ErrorValue::Num, "#NUM!" },
    { xl::ErrorValue::NA, "#N/A" },
} };

bool isDigit(char c)
{
    return c >= '0' && c <= '9';
}
std::string_view trimBlanks(std::string_view text)
{
    while (!text.empty() && text.front() == ' ')
        text.remove_prefix(1);
    while (!text.empty() && text.back() == ' ')
        text.remove_suffix(1);
    return text;
}

// Reads up to maxDigits digits from the front of text; nothing when there are none.
std::optional<int> takeNumber(std::string_view& text, std::size_t maxDigits)
{
    std::size_t length = 0;
    while (length < text.size() && isDigit(text[length]))
        ++length;
    if (length == 0 || length > maxDigits)
        return std::nullopt;
    int value = 0;
    std::from_chars(text.data(), text.data() + length, value);
    text.remove_prefix(length);
    return value;
}

std::optional<ParsedNumber> parseDate(std::string_view text)
{
    const std::string_view whole = text;
    const std::optional<int> month = takeNumber(text, 2);
    if (!month || text.empty() || (text.front() != '/' && text.front() != '-'))
        return std::nullopt;
    const char separator = text.front();
    text.remove_prefix(1);
    const std::optional<int> day = takeNumber(text, 2);
    if (!day || text.empty() || text.front() != separator)
        return std::nullopt;
    text.remove_prefix(1);
    const std::size_t yearStart = whole.size() - text.size();
    std::optional<int> year = takeNumber(text, 4);
    const std::size_t yearDigits = whole.size() - text.size() - yearStart;
    if (!year || !text.empty() || (yearDigits != 2 && yearDigits != 4 && yearDigits != 1))
        return std::nullopt;
    if (yearDigits <= 2)
        *year += *year < 30 ? 2000 : 1900;
    else if (*year < 1900)
        return std::nullopt;
    if (*month < 1 || *month > 12 || *day < 1)
        return std::nullopt;
    // The day must exist in that month (29 February 1900 does, in this date system).
    const std::optional<int> serial = dateSerial(*year, *month, *day);
    if (!serial || calendarDate(*serial)->month != *month)
        return std::nullopt;
    return ParsedNumber { static_cast<double>(*serial), NumberForm::Date, false };
}

// Digits with optional thousands separators (groups of three after the first comma).
bool takeIntegerPart(std::string_view& text, std::string& digits, bool& grouped)
{
    std::size_t groupLength = 0;
    bool any = false;
    while (!text.empty()) {
        const char c = text.front();
        if (isDigit(c)) {
            digits += c;
            ++groupLength;
            any = true;
        } else if (c == ',') {
            if (!any || (grouped && groupLength != 3) || (!grouped && groupLength > 3))
                return false;
            grouped = true;
            groupLength = 0;
        } else {
            break;
        }
        text.remove_prefix(1);
    }
    return !grouped || groupLength == 3;
}

std::optional<ParsedNumber> parsePlainNumber(std::string_view text)
{
    bool negative = false;
    bool parenthesised = false;
    if (!text.empty() && (text.front() == '+' || text.front() == '-')) {
        negative = text.front() == '-';
        text.remove_prefix(1);
    } else if (!text.empty() && text.front() == '(') {
        if (text.size() < 2 || text.back() != ')')
            return std::nullopt;
        parenthesised = negative = true;
        text = text.substr(1, text.size() - 2);
    }

    ParsedNumber parsed;
    std::string cleaned; // the number without signs and separators, for from_chars
    bool grouped = false;
    if (!takeIntegerPart(text, cleaned, grouped))
        return std::nullopt;
    bool anyDigits = !cleaned.empty();
    if (!text.empty() && text.front() == '.') {
        cleaned += '.';
        text.remove_prefix(1);
        while (!text.empty() && isDigit(text.front())) {
            cleaned += text.front();
            parsed.hasFraction = true;
            anyDigits = true;
            text.remove_prefix(1);
        }
    }
    if (!anyDigits)
        return std::nullopt;
    bool scientific = false;
    if (!text.empty() && (text.front() == 'e' || text.front() == 'E')) {
        cleaned += 'e';
        text.remove_prefix(1);
        if (!text.empty() && (text.front() == '+' || text.front() == '-')) {
            cleaned += text.front();
            text.remove_prefix(1);
        }
        if (text.empty() || !isDigit(text.front()))
            return std::nullopt;
        while (!text.empty() && isDigit(text.front())) {
            cleaned += text.front();
            text.remove_prefix(1);
        }
        scientific = true;
    }
    bool percent = false;
    if (!text.empty() && text.front() == '%') {
        percent = true;
        text.remove_prefix(1);
    }
    if (!text.empty() || (scientific && (grouped || percent)))
        return std::nullopt;

    double value = 0.0;
    const auto [end, error] = std::from_chars(cleaned.data(), cleaned.data() + cleaned.size(), value);
    if (error != std::errc() || end != cleaned.data() + cleaned.size() || !std::isfinite(value))
        return std::nullopt;
    if (percent)
        value /= 100.0;
    parsed.value = negative ? -value : value;
    parsed.form = percent ? NumberForm::Percent
        : scientific      ? NumberForm::Scientific
        : grouped         ? NumberForm::Grouped
                          : NumberForm::Plain;
    if (parenthesised && parsed.form != NumberForm::Plain && parsed.form != NumberForm::Grouped)
        return std::nullopt;
    return parsed;
}

} // namespace

std::string numberText(double value)
{
    if (value == 0.0)
        return "0";
    std::array<char, 40> buffer {};
    const auto result
        = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, std::chars_format::general, 15);
    std::string text(buffer.data(), result.ptr);
    std::transform(text.begin(), text.end(), text.begin(), [](char c) { return c == 'e' ? 'E' : c; });
    return text;
}

std::string_view errorText(xl::ErrorValue error)
{
    for (const auto& [value, text] : kErrorTexts) {
        if (value == error)
            return text;
    }
    return "#VALUE!";
}

std::optional<xl::ErrorValue> parseErrorText(std::string_view text)
{
    for (const auto& [value, name] : kErrorTexts) {
        if (equalsIgnoringCase(name, text))
            return value;
    }
    return std::nullopt;
}

std::optional<ParsedNumber> parseNumberText(std::string_view text)
{
    text = trimBlanks(text);
    if (text.empty())
        return std::nullopt;
    if (std::optional<ParsedNumber> date = parseDate(text))
        return date;
    return parsePlainNumber(text);
}

} // namespace penmoor::engine
