#pragma once

#include <filesystem>
#include <string_view>

#include <QCursor>

namespace penmoor {

// The optional pointer file in the program's folder.
inline constexpr std::string_view kHandPointerFileName = "HAND-M.CUR";

// The custom pointer that the windows show over their buttons: the cursor in the program's
// "HAND-M.CUR", with the hot spot the file gives, when that file is there and readable;
// otherwise the system's pointing hand.
QCursor loadHandPointer(const std::filesystem::path& programFolder);

} // namespace penmoor
