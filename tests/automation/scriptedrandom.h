#pragma once

#include "shell/unitrandom.h"

#include <cstddef>
#include <memory>
#include <vector>

namespace penmoor::testing {

// A random source that gives the listed values in turn, starting over after the last.
inline UnitRandom scriptedRandom(std::vector<double> values)
{
    auto next = std::make_shared<std::size_t>(0);
    return [values = std::move(values), next] { return values[(*next)++ % values.size()]; };
}

// The draws that make temporaryWorkbookName give "qarnet" + digits + ".xls".
inline std::vector<double> drawsForDigits(const char* digits)
{
    std::vector<double> draws;
    for (const char* d = digits; *d != '\0'; ++d) {
        draws.push_back((*d - '1' + 0.5) / 9.0);
    }
    return draws;
}

} // namespace penmoor::testing
