#pragma once

#include <cstdint>
#include <span>
#include <string_view>

namespace penmoor::engine {

// How a function takes one of its operands, as the .xls token classes record it: as a value, or
// as a reference whose cells it reads itself (SUM over a block).
enum class ParameterClass : std::uint8_t {
    Value,
    Reference,
};

// One function the engine evaluates, with its number in the .xls function table. The .xls
// writer and reader share this table with the formula parser and the evaluator.
struct FunctionInfo {
    std::string_view name;
    std::uint16_t index = 0;
    std::uint8_t minArguments = 0;
    std::uint8_t maxArguments = 0;
    // One letter per parameter, V (value) or R (reference); the last one repeats.
    std::string_view parameterClasses;

    // A fixed count is written as a plain function call, any other with its count.
    bool hasFixedArgumentCount() const { return minArguments == maxArguments; }
    ParameterClass parameterClass(int argument) const;
};

std::span<const FunctionInfo> functionTable();
// Looks a function up by name in either letter case; nullptr when the table does not know it.
const FunctionInfo* findFunction(std::string_view name);
const FunctionInfo* findFunction(std::uint16_t index);

} // namespace penmoor::engine
