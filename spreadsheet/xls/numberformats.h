#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace penmoor::xls {

// Number formats by their index in the file. Indexes below 164 are built in: a reader knows
// them without a FORMAT record. Some built-ins depend on the reader's locale (the currency
// formats 5-8 and 41-44, the dates 14 and 22), so the writer uses the built-in index only for
// the others and stores the locale ones as FORMAT records in their en-US form, as Excel does.
inline constexpr std::uint16_t kFirstCustomFormat = 164;
inline constexpr std::uint16_t kLastCustomFormat = 392;

// The built-in index of a format text that means the same in every locale.
std::optional<std::uint16_t> builtinFormatIndex(std::string_view text);
// The text of a built-in index as an en-US reader shows it, or nothing for unknown indexes.
std::optional<std::string> builtinFormatText(std::uint16_t index);

struct LocaleFormat {
    std::uint16_t index;
    std::string_view text;
};
// The locale-dependent currency formats, which Excel always stores.
std::span<const LocaleFormat> currencyFormats();

} // namespace penmoor::xls
