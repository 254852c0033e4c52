#pragma once

#include <string>
#include <string_view>

namespace penmoor {

// Item names match when they are equal, letter case included, after the first "&" of each has
// been removed (only the first: "R&D" matches "RD" and "&RD", "R&&D" does not match "R&D").

// The name with its first "&" removed: two names match exactly when their keys are equal.
std::string nameMatchKey(std::string_view name);

bool namesMatch(std::string_view first, std::string_view second);

} // namespace penmoor
