#pragma once

#include <functional>

namespace penmoor {

// A source of random numbers r with 0 <= r < 1. Routines that draw take one as a parameter
// so that tests can force every outcome.
using UnitRandom = std::function<double()>;

// A generator seeded once from the system's entropy source.
UnitRandom seededUnitRandom();

} // namespace penmoor
