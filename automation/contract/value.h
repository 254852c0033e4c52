#pragma once

#include <cstdint>
#include <string>
#include <variant>

namespace xl {

// The error values a cell can hold, with the codes the .xls format gives them.
enum class ErrorValue : std::uint8_t {
    Null = 0x00, // #NULL!
    Div0 = 0x07, // #DIV/0!
    Value = 0x0F, // #VALUE!
    Ref = 0x17, // #REF!
    Name = 0x1D, // #NAME?
    Num = 0x24, // #NUM!
    NA = 0x2A, // #N/A
};

// The value of a cell as the object model reads it: empty, a number (dates are serial
// numbers of the 1900 date system), text, a boolean or an error.
using Value = std::variant<std::monostate, double, std::string, bool, ErrorValue>;

} // namespace xl
