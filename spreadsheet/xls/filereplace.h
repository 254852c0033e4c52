#pragma once

#include <filesystem>
#include <system_error>

namespace penmoor::xls {

// Moves `from` to `to`, replacing a file at `to` in one step. POSIX rename does that; on
// Windows the C runtime's rename refuses an existing target, so the system call is asked to
// replace it instead.
void replaceFile(const std::filesystem::path& from, const std::filesystem::path& to, std::error_code& error);

} // namespace penmoor::xls
