#include "app/buildtool/itemsfile.h"

#include "app/buildtool/buildrequest.h"
#include "app/buildtool/utf8text.h"
#include "model/defaultlist.h"
#include "model/itemrules.h"
#include "model/namematching.h"
#include "model/templateitem.h"
#include "shell/utf8path.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <fstream>
#include <iterator>
#include <unordered_map>

namespace penmoor {

namespace {

// The editor refuses shorter names.
constexpr std::size_t kShortestName = 3;
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

UsageError lineProblem(std::size_t line, const std::string& problem)
{
    return UsageError("line " + std::to_string(line) + ": " + problem + ".");
}

std::vector<std::string> splitLines(std::string_view content)
{
    if (content.substr(0, kByteOrderMark.size()) == kByteOrderMark) {
        content.remove_prefix(kByteOrderMark.size());
    }
    std::vector<std::string> lines;
    while (!content.empty()) {
        const std::size_t end = content.find('\n');
        std::string_view line = content.substr(0, end);
        if (end != std::string_view::npos && !line.empty() && line.back() == '\r') {
            line.remove_suffix(1);
        }
        lines.emplace_back(line);
        content.remove_prefix(end == std::string_view::npos ? content.size() : end + 1);
    }
    return lines;
}

void checkName(std::string_view name, std::size_t line)
{
    if (!isWellFormedUtf8(name)) {
        throw lineProblem(line, "the text is not UTF-8");
    }
    if (std::any_of(
            name.begin(), name.end(), [](char c) { return static_cast<unsigned char>(c) < 0x20 && c != '\t'; })) {
        throw lineProblem(line, "the name holds a control character");
    }
    if (name.find_first_not_of(" \t") == std::string_view::npos) {
        throw lineProblem(line, "the name is empty or blank");
    }
    if (name.size() > kLongestCellText) {
        throw lineProblem(line, "the name is longer than a cell can hold");
    }
    if (name.size() < kShortestName) {
        throw lineProblem(line, "the name " + inQuotes(name) + " is shorter than 3 characters");
    }
}

// The system rows, in the order of the default list.
std::vector<std::string_view> systemRowsInDefaultOrder()
{
    std::vector<std::string_view> rows;
    std::copy_if(kDefaultItemNames.begin(), kDefaultItemNames.end(), std::back_inserter(rows),
        [](std::string_view name) { return IsSystemItem(name); });
    return rows;
}

void checkSystemRows(const std::vector<std::string>& names)
{
    std::size_t previousLine = 0;
    std::string_view previousRow;
    for (const std::string_view row : systemRowsInDefaultOrder()) {
        const auto found = std::find(names.begin(), names.end(), row);
        if (found == names.end()) {
            throw UsageError("the system row " + inQuotes(row) + " is missing; it must be written exactly so.");
        }
        const auto line = static_cast<std::size_t>(found - names.begin()) + 1;
        if (line < previousLine) {
            throw lineProblem(line,
                "the system row " + inQuotes(row) + " must come after " + inQuotes(previousRow) + " (line "
                    + std::to_string(previousLine) + ")");
        }
        previousLine = line;
        previousRow = row;
    }
}

} // namespace

std::vector<std::string> parseItemList(std::string_view content)
{
    std::vector<std::string> names = splitLines(content);
    if (names.size() > static_cast<std::size_t>(kMaximumItemCount)) {
        throw UsageError("there are " + std::to_string(names.size()) + " names; the list holds at most "
            + std::to_string(kMaximumItemCount) + ".");
    }
    std::unordered_map<std::string, std::size_t> lineByKey;
    for (std::size_t index = 0; index < names.size(); ++index) {
        const std::size_t line = index + 1;
        checkName(names[index], line);
        const auto [earlier, inserted] = lineByKey.emplace(nameMatchKey(names[index]), line);
        if (!inserted) {
            throw lineProblem(line,
                "the name " + inQuotes(names[index]) + " matches " + inQuotes(names[earlier->second - 1]) + " on line "
                    + std::to_string(earlier->second));
        }
    }
    checkSystemRows(names);
    return names;
}

std::vector<std::string> readItemsFile(const std::filesystem::path& path)
{
    const std::string shown = "--items " + inQuotes(utf8Text(path)) + ": ";
    std::error_code status;
    if (std::filesystem::is_directory(path, status)) {
        throw UsageError(shown + "that is a folder, not a file.");
    }
    errno = 0;
    std::ifstream in(path, std::ios::binary);
    if (!in) {
        throw UsageError(shown + "the file cannot be read: " + std::strerror(errno != 0 ? errno : EIO) + ".");
    }
    const std::string content { std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>() };
    try {
        return parseItemList(content);
    } catch (const UsageError& problem) {
        throw UsageError(shown + problem.what());
    }
}

} // namespace penmoor
