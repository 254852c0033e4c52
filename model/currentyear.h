#pragma once

#include <functional>

namespace penmoor {

// Where the model takes "the current calendar year" from; tests pass a fixed one.
using YearSource = std::function<int()>;

// The calendar year of the local date now.
int currentCalendarYear();

} // namespace penmoor
