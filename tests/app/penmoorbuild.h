#pragma once

#include "tests/xls/support/readers.h"

#include <filesystem>
#include <string>
#include <vector>

namespace penmoor::testing {

// Runs the built penmoor-build with these arguments and captures its exit status and output.
inline xls::test::CommandResult runPenmoorBuild(const std::vector<std::string>& arguments)
{
    std::vector<std::string> words { PENMOOR_BUILD_PROGRAM };
    words.insert(words.end(), arguments.begin(), arguments.end());
    return xls::test::runCommand(words, 120);
}

// The names in a folder, sorted.
inline std::vector<std::string> folderContents(const std::filesystem::path& folder)
{
    std::vector<std::string> names;
    for (const std::filesystem::directory_entry& entry : std::filesystem::directory_iterator(folder)) {
        names.push_back(entry.path().filename().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

} // namespace penmoor::testing
