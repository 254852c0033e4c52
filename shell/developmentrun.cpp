#include "shell/developmentrun.h"

#include "shell/fileutils.h"

#include <cstdlib>

namespace penmoor {

bool IsInIDE(const std::filesystem::path& programFolder, const char* variableValue)
{
    if (variableValue) {
        const std::string_view value(variableValue);
        if (value == "1") {
            return true;
        }
        if (value == "0") {
            return false;
        }
    }
    return FileExists(programFolder / kBuildTreeMarker);
}

bool IsInIDE(const std::filesystem::path& programFolder)
{
    return IsInIDE(programFolder, std::getenv(std::string(kInIdeVariable).c_str()));
}

} // namespace penmoor
