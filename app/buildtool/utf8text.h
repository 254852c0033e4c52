#pragma once

#include <string_view>

namespace penmoor {

// True when text is well-formed UTF-8: no stray continuation byte, no overlong form, no
// surrogate, nothing beyond U+10FFFF.
bool isWellFormedUtf8(std::string_view text);

} // namespace penmoor
