#include "model/storedvalue.h"

#include "model/numbertext.h"

#include <algorithm>
#include <cctype>
#include <cmath>

namespace penmoor {

namespace {

std::string_view trimmedBlanks(std::string_view text)
{
    while (!text.empty() && isBlank(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isBlank(text.back())) {
        text.remove_suffix(1);
    }
    return text;
}

bool equalsIgnoringCase(std::string_view text, std::string_view word)
{
    return std::equal(text.begin(), text.end(), word.begin(), word.end(), [](char a, char b) {
        return std::tolower(static_cast<unsigned char>(a)) == std::tolower(static_cast<unsigned char>(b));
    });
}

// The value of a text that is one number and nothing else.
std::optional<double> wholeTextNumber(std::string_view text)
{
    const std::string_view trimmed = trimmedBlanks(text);
    const LeadingNumber number = scanLeadingNumber(trimmed);
    if (number.length == 0 || number.length != trimmed.size()) {
        return std::nullopt;
    }
    return number.value;
}

} // namespace

std::string booleanText(bool value)
{
    return value ? "True" : "False";
}

bool readStoredBoolean(std::string_view text, bool fallback)
{
    const std::string_view trimmed = trimmedBlanks(text);
    if (equalsIgnoringCase(trimmed, "True")) {
        return true;
    }
    if (equalsIgnoringCase(trimmed, "False")) {
        return false;
    }
    if (const std::optional<double> number = wholeTextNumber(trimmed)) {
        return *number != 0.0;
    }
    return fallback;
}

std::optional<int> readStoredCount(std::string_view text, int maximum)
{
    const std::optional<double> number = wholeTextNumber(text);
    if (!number || std::trunc(*number) != *number || *number < 1.0 || *number > maximum) {
        return std::nullopt;
    }
    return static_cast<int>(*number);
}

} // namespace penmoor
