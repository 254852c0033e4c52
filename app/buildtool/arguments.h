#pragma once

#include <string>
#include <vector>

namespace penmoor {

// The program's arguments after its name, as UTF-8 texts: on Windows they are taken from the
// wide command line, since argv there is in the local code page.
std::vector<std::string> commandArguments(int argc, char** argv);

} // namespace penmoor
