#pragma once

#include <filesystem>
#include <string>

namespace penmoor {

// A path as the UTF-8 text the spreadsheet contract and the error report take.
inline std::string utf8Text(const std::filesystem::path& path)
{
    const std::u8string text = path.u8string();
    return { text.begin(), text.end() };
}

} // namespace penmoor
