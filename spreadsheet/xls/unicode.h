#pragma once

#include <string>
#include <string_view>

namespace penmoor::xls {

// Conversions between the model's UTF-8 text and the UTF-16 text of the file formats.
// Malformed input (a broken UTF-8 sequence, a lone surrogate) becomes U+FFFD, so no text is
// ever dropped silently and no conversion fails.
std::u16string utf8ToUtf16(std::string_view text);
std::string utf16ToUtf8(std::u16string_view text);

} // namespace penmoor::xls
