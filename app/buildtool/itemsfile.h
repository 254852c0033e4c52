#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

namespace penmoor {

// The item list of --items: UTF-8 text, one item name per line, each line exactly as it
// stands (blanks kept at both ends). A line may end in LF or CR LF; a final line break adds no
// item; a byte order mark at the start is skipped. Raises UsageError, naming the line, for a
// list the main window could not hold: text that is not UTF-8, a control character, a name
// of fewer than 3 characters or of blanks only, a name that matches an earlier one under the
// program's name matching, more than 32,768 names, and the eight system rows missing, not
// written exactly, or out of their default order.
std::vector<std::string> parseItemList(std::string_view content);

// Reads the file and parses it; the message of a refusal names the file.
std::vector<std::string> readItemsFile(const std::filesystem::path& path);

} // namespace penmoor
