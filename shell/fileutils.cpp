#include "shell/fileutils.h"

#include <string>
#include <system_error>

namespace penmoor {

namespace {

// A path with an embedded NUL would be cut short by the system and name another file.
bool isUsable(const std::filesystem::path& path)
{
    const auto& native = path.native();
    return !native.empty() && native.find(std::filesystem::path::value_type {}) == native.npos;
}

} // namespace

std::filesystem::path pathFromUtf8(std::string_view text)
{
    return std::filesystem::path(std::u8string(text.begin(), text.end()));
}

// Both routines use the error_code overloads and drop the code on purpose: a failing check or
// deletion must never interrupt the caller or show a message.

bool FileExists(const std::filesystem::path& path)
{
    if (!isUsable(path)) {
        return false;
    }
    std::error_code error;
    if (std::filesystem::is_directory(path, error) || error) {
        return false;
    }
    static_cast<void>(std::filesystem::last_write_time(path, error));
    return !error;
}

void DeleteFile(const std::filesystem::path& path)
{
    if (!isUsable(path)) {
        return;
    }
    std::error_code error;
    if (std::filesystem::is_directory(std::filesystem::symlink_status(path, error))) {
        return;
    }
    std::filesystem::remove(path, error);
}

} // namespace penmoor
