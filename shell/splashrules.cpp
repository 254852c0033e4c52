#include "shell/splashrules.h"

#include <charconv>
#include <cmath>
#include <string>
#include <system_error>

namespace penmoor {

namespace {

bool isBlank(char c)
{
    return c == ' ' || c == '\t';
}

// The number a stored text holds, surrounded blanks allowed; "0" for anything else.
double storedNumber(std::string_view text)
{
    while (!text.empty() && isBlank(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isBlank(text.back())) {
        text.remove_suffix(1);
    }
    double value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc {} || end != text.data() + text.size() || !std::isfinite(value)) {
        return 0;
    }
    return value;
}

} // namespace

bool isSplashWanted(const SettingsStore& settings)
{
    return storedNumber(settings.read(std::string(kShowAgainKey), "0")) == 0;
}

std::filesystem::path splashPicturePath(const std::filesystem::path& programFolder)
{
    std::error_code error;
    std::filesystem::directory_iterator entries(programFolder / kSplashFolder, error);
    std::filesystem::path first;
    // A folder that cannot be listed simply yields no picture.
    for (; !error && entries != std::filesystem::directory_iterator(); entries.increment(error)) {
        const std::filesystem::path name = entries->path().filename();
        std::error_code statusError;
        if (name.native().front() == '.' || !entries->is_regular_file(statusError)) {
            continue;
        }
        if (first.empty() || name < first.filename()) {
            first = entries->path();
        }
    }
    return first;
}

} // namespace penmoor
