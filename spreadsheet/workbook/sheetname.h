#pragma once

#include <string_view>

namespace penmoor::engine {

// Sheet names follow the desktop application's rules: 1 to 31 characters, none of
// : \ / ? * [ ], not beginning or ending with an apostrophe. Raises xl::Error naming the
// problem otherwise.
void checkSheetNameRules(std::string_view name);

// Whether two names name the same sheet: letter case does not count.
bool sameSheetName(std::string_view a, std::string_view b);

} // namespace penmoor::engine
