#pragma once

#include <stdexcept>
#include <string>

namespace penmoor::xls {

// Raised by the readers when a file is not what it claims to be. what() is the reason in words
// a user can act on ("the sector chain of the directory loops"); the caller adds the file name.
class FormatError : public std::runtime_error {
public:
    explicit FormatError(const std::string& reason)
        : std::runtime_error(reason)
    {
    }
};

// Raised by the writers when the workbook holds something the .xls format cannot store.
class WriteError : public std::runtime_error {
public:
    explicit WriteError(const std::string& reason)
        : std::runtime_error(reason)
    {
    }
};

} // namespace penmoor::xls
