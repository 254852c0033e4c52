#include "spreadsheet/xls/filereplace.h"

#ifdef _WIN32
#include <windows.h>
#endif

namespace penmoor::xls {

void replaceFile(const std::filesystem::path& from, const std::filesystem::path& to, std::error_code& error)
{
#ifdef _WIN32
    if (MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH))
        error.clear();
    else
        error = std::error_code(static_cast<int>(GetLastError()), std::system_category());
#else
    std::filesystem::rename(from, to, error);
#endif
}

} // namespace penmoor::xls
