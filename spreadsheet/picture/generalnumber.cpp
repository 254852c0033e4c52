#include "spreadsheet/picture/generalnumber.h"

#include "spreadsheet/picture/decimaldigits.h"

#include <algorithm>

namespace penmoor::picture {

namespace {

constexpr int kMaxCharacters = 11;
constexpr int kLargestFixedExponent = 10; // 11 integer digits
constexpr int kSmallestFixedExponent = -4; // 0.0001

void addForm(std::vector<std::string>& forms, std::string form, bool negative)
{
    if (static_cast<int>(form.size()) > kMaxCharacters) {
        return;
    }
    if (negative) {
        form.insert(form.begin(), '-');
    }
    if (forms.empty() || forms.back() != form) {
        forms.push_back(std::move(form));
    }
}

void addFixedForms(std::vector<std::string>& forms, double value, int exponent, bool negative)
{
    const int integerDigits = std::max(exponent + 1, 1);
    for (int decimals = std::max(kMaxCharacters - integerDigits - 1, 0); decimals >= 0; --decimals) {
        FixedDigits digits = fixedDigits(value, decimals);
        if (digits.isZero()) {
            return; // rounded away: the scientific forms say more
        }
        while (!digits.fraction.empty() && digits.fraction.back() == '0') {
            digits.fraction.pop_back();
        }
        std::string form = digits.integer.empty() ? "0" : digits.integer;
        if (!digits.fraction.empty()) {
            form += '.' + digits.fraction;
        }
        addForm(forms, std::move(form), negative);
    }
}

void addScientificForms(std::vector<std::string>& forms, double value, bool negative)
{
    for (int decimals = 5; decimals >= 0; --decimals) {
        ScientificDigits digits = scientificDigits(value, decimals);
        while (digits.digits.size() > 1 && digits.digits.back() == '0') {
            digits.digits.pop_back();
        }
        std::string form(1, digits.digits.front());
        if (digits.digits.size() > 1) {
            form += '.' + digits.digits.substr(1);
        }
        form += digits.exponent < 0 ? "E-" : "E+";
        form += integerText(digits.exponent < 0 ? -digits.exponent : digits.exponent, 2);
        addForm(forms, std::move(form), negative);
    }
}

} // namespace

std::vector<std::string> generalNumberForms(double value)
{
    std::vector<std::string> forms;
    if (value == 0.0) {
        forms.emplace_back("0");
        return forms;
    }
    const bool negative = value < 0;
    const int exponent = decimalExponent(value);
    if (exponent >= kSmallestFixedExponent && exponent <= kLargestFixedExponent) {
        addFixedForms(forms, value, exponent, negative);
    }
    addScientificForms(forms, value, negative);
    return forms;
}

} // namespace penmoor::picture
