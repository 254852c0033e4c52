#pragma once

#include "automation/contract/value.h"

#include <cstdint>
#include <string>
#include <variant>
#include <vector>

namespace penmoor::engine {

// A formula is kept as a postfix (RPN) token array, so that each token maps onto one .xls
// formula token and back.

// One coordinate of a reference: a relative offset from the formula's own cell, or an
// absolute 1-based index. Offsets are kept even when the target falls outside the sheet;
// such a reference evaluates to #REF!.
struct ReferencePart {
    int value = 0;
    bool relative = true;

    // The 1-based index this part names from a formula in row or column `origin`.
    int resolve(int origin) const { return relative ? origin + value : value; }

    bool operator==(const ReferencePart&) const = default;
};

struct CellReference {
    ReferencePart row;
    ReferencePart column;

    bool operator==(const CellReference&) const = default;
};

enum class Operator : std::uint8_t {
    Add,
    Subtract,
    Multiply,
    Divide,
    Power,
    Concatenate,
    Less,
    LessEqual,
    Equal,
    GreaterEqual,
    Greater,
    NotEqual,
    UnaryPlus,
    UnaryMinus,
    Percent, // postfix: x% is x / 100
};

struct NumberToken {
    double value = 0.0;
    bool operator==(const NumberToken&) const = default;
};
struct StringToken {
    std::string value;
    bool operator==(const StringToken&) const = default;
};
struct BooleanToken {
    bool value = false;
    bool operator==(const BooleanToken&) const = default;
};
struct ErrorToken {
    xl::ErrorValue value = xl::ErrorValue::NA;
    bool operator==(const ErrorToken&) const = default;
};
// An omitted function argument, as in IF(RC[-1],,1).
struct MissingArgumentToken {
    bool operator==(const MissingArgumentToken&) const = default;
};
struct ReferenceToken {
    CellReference cell;
    bool operator==(const ReferenceToken&) const = default;
};
// A block from one corner to the other, each corner as written.
struct AreaToken {
    CellReference first;
    CellReference last;
    bool operator==(const AreaToken&) const = default;
};
struct OperatorToken {
    Operator op = Operator::Add;
    bool operator==(const OperatorToken&) const = default;
};
// Parentheses around the operand before it; they change nothing but how the formula reads.
struct ParenthesisToken {
    bool operator==(const ParenthesisToken&) const = default;
};
// A call of a function with argumentCount operands before it. functionIndex is the function's
// number in the .xls function table (SUM 4, DATE 65, ...); a name the table does not know is
// kept in `name` with functionIndex kUnknownFunctionIndex and evaluates to #NAME?.
struct FunctionToken {
    std::uint16_t functionIndex = 0;
    std::uint8_t argumentCount = 0;
    std::string name; // only for unknown functions
    bool operator==(const FunctionToken&) const = default;
};
// A name that is neither a reference nor a function: it names nothing and evaluates to #NAME?.
struct NameToken {
    std::string name;
    bool operator==(const NameToken&) const = default;
};

// The .xls number for calls of functions outside the built-in table (user-defined functions).
inline constexpr std::uint16_t kUnknownFunctionIndex = 255;

using Token = std::variant<NumberToken, StringToken, BooleanToken, ErrorToken, MissingArgumentToken, ReferenceToken,
    AreaToken, OperatorToken, ParenthesisToken, FunctionToken, NameToken>;
using TokenArray = std::vector<Token>;

} // namespace penmoor::engine
