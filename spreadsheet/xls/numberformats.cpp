#include "spreadsheet/xls/numberformats.h"

#include <algorithm>
#include <array>

namespace penmoor::xls {

namespace {

struct BuiltinFormat {
    std::uint16_t index;
    std::string_view text;
    bool sameInEveryLocale;
};

constexpr std::array kBuiltins {
    BuiltinFormat { 0, "General", true },
    BuiltinFormat { 1, "0", true },
    BuiltinFormat { 2, "0.00", true },
    BuiltinFormat { 3, "#,##0", true },
    BuiltinFormat { 4, "#,##0.00", true },
    BuiltinFormat { 9, "0%", true },
    BuiltinFormat { 10, "0.00%", true },
    BuiltinFormat { 11, "0.00E+00", true },
    BuiltinFormat { 12, "# ?/?", true },
    BuiltinFormat { 13, R"(# ??/??)", true },
    BuiltinFormat { 14, "m/d/yyyy", false },
    BuiltinFormat { 15, "d-mmm-yy", true },
    BuiltinFormat { 16, "d-mmm", true },
    BuiltinFormat { 17, "mmm-yy", true },
    BuiltinFormat { 18, "h:mm AM/PM", true },
    BuiltinFormat { 19, "h:mm:ss AM/PM", true },
    BuiltinFormat { 20, "h:mm", true },
    BuiltinFormat { 21, "h:mm:ss", true },
    BuiltinFormat { 22, "m/d/yyyy h:mm", false },
    BuiltinFormat { 37, "#,##0 ;(#,##0)", true },
    BuiltinFormat { 38, "#,##0 ;[Red](#,##0)", true },
    BuiltinFormat { 39, "#,##0.00;(#,##0.00)", true },
    BuiltinFormat { 40, "#,##0.00;[Red](#,##0.00)", true },
    BuiltinFormat { 45, "mm:ss", true },
    BuiltinFormat { 46, "[h]:mm:ss", true },
    BuiltinFormat { 47, "mmss.0", true },
    BuiltinFormat { 48, "##0.0E+0", true },
    BuiltinFormat { 49, "@", true },
};

constexpr std::array kCurrencyFormats {
    LocaleFormat { 5, R"("$"#,##0_);\("$"#,##0\))" },
    LocaleFormat { 6, R"("$"#,##0_);[Red]\("$"#,##0\))" },
    LocaleFormat { 7, R"("$"#,##0.00_);\("$"#,##0.00\))" },
    LocaleFormat { 8, R"("$"#,##0.00_);[Red]\("$"#,##0.00\))" },
    LocaleFormat { 41, R"(_(* #,##0_);_(* \(#,##0\);_(* "-"_);_(@_))" },
    LocaleFormat { 42, R"(_("$"* #,##0_);_("$"* \(#,##0\);_("$"* "-"_);_(@_))" },
    LocaleFormat { 43, R"(_(* #,##0.00_);_(* \(#,##0.00\);_(* "-"??_);_(@_))" },
    LocaleFormat { 44, R"(_("$"* #,##0.00_);_("$"* \(#,##0.00\);_("$"* "-"??_);_(@_))" },
};

} // namespace

std::optional<std::uint16_t> builtinFormatIndex(std::string_view text)
{
    const auto it = std::find_if(kBuiltins.begin(), kBuiltins.end(),
        [&](const BuiltinFormat& f) { return f.sameInEveryLocale && f.text == text; });
    if (it != kBuiltins.end())
        return it->index;
    const auto currency = std::find_if(
        kCurrencyFormats.begin(), kCurrencyFormats.end(), [&](const LocaleFormat& f) { return f.text == text; });
    if (currency != kCurrencyFormats.end())
        return currency->index;
    return std::nullopt;
}

std::optional<std::string> builtinFormatText(std::uint16_t index)
{
    for (const BuiltinFormat& format : kBuiltins) {
        if (format.index == index)
            return std::string(format.text);
    }
    for (const LocaleFormat& format : kCurrencyFormats) {
        if (format.index == index)
            return std::string(format.text);
    }
    return std::nullopt;
}

std::span<const LocaleFormat> currencyFormats()
{
    return kCurrencyFormats;
}

} // namespace penmoor::xls
