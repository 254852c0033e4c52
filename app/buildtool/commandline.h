#pragma once

#include "app/buildtool/buildrequest.h"

#include <string>
#include <vector>

namespace penmoor {

struct CommandLine {
    bool helpWanted = false;
    BuildRequest request;
};

// Reads the arguments after the program name. Raises UsageError for an unknown or repeated
// option, a missing value, a year or week count the main window would refuse or correct, and
// a missing -o. With --help nothing else is checked. The items file named by --items is read
// and checked here too (readItemsFile), and so are the output paths (checkOutputPaths).
CommandLine parseCommandLine(const std::vector<std::string>& arguments, int currentYear);

// The text of --help.
std::string usageText();

} // namespace penmoor
