#pragma once

#include "app/buildtool/buildrequest.h"

namespace penmoor {

// Raises UsageError unless the workbook goes to a name ending in ".xls" and the picture to one
// ending in ".png" (letter case ignored), each in a folder that exists, neither of them an
// existing folder, and not both to the same file.
void checkOutputPaths(const BuildRequest& request);

// The folder a file named by path goes into: the current folder for a bare name.
std::filesystem::path folderOf(const std::filesystem::path& path);

} // namespace penmoor
