#pragma once

#include "shell/unitrandom.h"

#include <filesystem>
#include <string>

namespace penmoor {

// "qarnet", eight digits each from 1 to 9 (never 0) drawn from random, then ".xls".
std::string temporaryWorkbookName(const UnitRandom& random);

// Claims a fresh temporary workbook in folder: creates an empty file under a name of that form
// that nothing else carries, in one exclusive step, and returns its path. The file is the
// build's from then on; SaveAs replaces it with the workbook. A name already taken draws the
// next one at once. Raises std::runtime_error, naming the folder and the system's reason,
// when the folder does not take the file.
std::filesystem::path claimTemporaryWorkbook(const std::filesystem::path& folder, const UnitRandom& random);

} // namespace penmoor
