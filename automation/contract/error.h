#pragma once

#include <stdexcept>
#include <string>

namespace xl {

// Every failure of a spreadsheet operation. what() is the description text that the
// program's error report shows, so it names what failed in words a user can act on.
class Error : public std::runtime_error {
public:
    explicit Error(const std::string& description)
        : std::runtime_error(description)
    {
    }
};

} // namespace xl
