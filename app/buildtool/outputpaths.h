#pragma once

#include "app/buildtool/buildrequest.h"

namespace penmoor {

// Raises UsageError unless the workbook goes to a name ending in ".xls" and the picture to one
// ending in ".png" (letter case ignored), each in a folder that exists, neither of them an
// existing folder, and not both to the same file.
void checkOutputPaths(const BuildRequest& request);

} // namespace penmoor
