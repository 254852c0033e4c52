// Platform file: the command line as UTF-8 on POSIX and Windows.
#include "app/buildtool/arguments.h"

#ifdef _WIN32
// shellapi.h needs the declarations of windows.h first.
// clang-format off
#include <windows.h>
#include <shellapi.h>
// clang-format on
#endif

namespace penmoor {

#ifdef _WIN32

std::vector<std::string> commandArguments(int, char**)
{
    std::vector<std::string> arguments;
    int count = 0;
    wchar_t** wide = CommandLineToArgvW(GetCommandLineW(), &count);
    if (!wide) {
        return arguments;
    }
    for (int i = 1; i < count; ++i) {
        const int size = WideCharToMultiByte(CP_UTF8, 0, wide[i], -1, nullptr, 0, nullptr, nullptr);
        std::string text(static_cast<std::size_t>(size > 0 ? size - 1 : 0), '\0');
        if (size > 1) {
            WideCharToMultiByte(CP_UTF8, 0, wide[i], -1, text.data(), size, nullptr, nullptr);
        }
        arguments.push_back(std::move(text));
    }
    LocalFree(wide);
    return arguments;
}

#else

// The arguments' bytes as they come; a text that is not UTF-8 is refused where it matters.
std::vector<std::string> commandArguments(int argc, char** argv)
{
    return { argv + (argc > 0 ? 1 : 0), argv + argc };
}

#endif

} // namespace penmoor
