#pragma once

#include "tests/xls/support/readers.h"

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

} // namespace penmoor::testing
