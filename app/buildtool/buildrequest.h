#pragma once

#include "model/mainwindowview.h"

#include <filesystem>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace penmoor {

// Input that penmoor-build refuses before it writes anything; what() names the problem.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// A piece of the user's input as a refusal shows it.
inline std::string inQuotes(std::string_view text)
{
    return "\"" + std::string(text) + "\"";
}

// The most a cell takes, in bytes of UTF-8 text: longer names are refused up front rather
// than failing half-way through the build.
inline constexpr std::size_t kLongestCellText = 32767;

// One headless build, checked: every value is one the main window would build from without
// correcting it.
struct BuildRequest {
    std::string company;
    PeriodMode mode = PeriodMode::ByMonth;
    // By Year and By Month: the first and the last year.
    int firstYear = 0;
    int lastYear = 0;
    // By Week: the number of weeks.
    int weeks = 5;
    // The item names in list order; empty for the default list.
    std::vector<std::string> items;
    std::filesystem::path output;
    // Where the PNG picture of the sheet goes, if wanted.
    std::optional<std::filesystem::path> picture;
};

} // namespace penmoor
