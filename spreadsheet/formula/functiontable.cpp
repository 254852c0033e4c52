#include "spreadsheet/formula/functiontable.h"

#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <array>

namespace penmoor::engine {

namespace {

// Numbers, argument limits and parameter classes are those of the .xls function table
// (at most 30 arguments in that format).
constexpr std::array kFunctions {
    FunctionInfo { "COUNT", 0, 1, 30, "R" },
    FunctionInfo { "IF", 1, 2, 3, "VRR" },
    FunctionInfo { "SUM", 4, 1, 30, "R" },
    FunctionInfo { "AVERAGE", 5, 1, 30, "R" },
    FunctionInfo { "MIN", 6, 1, 30, "R" },
    FunctionInfo { "MAX", 7, 1, 30, "R" },
    FunctionInfo { "ABS", 24, 1, 1, "V" },
    FunctionInfo { "INT", 25, 1, 1, "V" },
    FunctionInfo { "TRUE", 34, 0, 0, "V" },
    FunctionInfo { "FALSE", 35, 0, 0, "V" },
    FunctionInfo { "AND", 36, 1, 30, "R" },
    FunctionInfo { "OR", 37, 1, 30, "R" },
    FunctionInfo { "NOT", 38, 1, 1, "V" },
    FunctionInfo { "DATE", 65, 3, 3, "V" },
    FunctionInfo { "DAY", 67, 1, 1, "V" },
    FunctionInfo { "MONTH", 68, 1, 1, "V" },
    FunctionInfo { "YEAR", 69, 1, 1, "V" },
};

} // namespace

ParameterClass FunctionInfo::parameterClass(int argument) const
{
    if (parameterClasses.empty())
        return ParameterClass::Value;
    const std::size_t at = std::min<std::size_t>(static_cast<std::size_t>(argument), parameterClasses.size() - 1);
    return parameterClasses[at] == 'R' ? ParameterClass::Reference : ParameterClass::Value;
}

std::span<const FunctionInfo> functionTable()
{
    return kFunctions;
}

const FunctionInfo* findFunction(std::string_view name)
{
    const auto it = std::find_if(kFunctions.begin(), kFunctions.end(),
        [&](const FunctionInfo& info) { return equalsIgnoringCase(info.name, name); });
    return it == kFunctions.end() ? nullptr : &*it;
}

const FunctionInfo* findFunction(std::uint16_t index)
{
    const auto it = std::find_if(
        kFunctions.begin(), kFunctions.end(), [&](const FunctionInfo& info) { return info.index == index; });
    return it == kFunctions.end() ? nullptr : &*it;
}

} // namespace penmoor::engine
