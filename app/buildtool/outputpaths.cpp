#include "app/buildtool/outputpaths.h"

#include "shell/utf8path.h"

#include <algorithm>
#include <cctype>
#include <string>
#include <system_error>

namespace penmoor {

namespace {

namespace fs = std::filesystem;

bool endsWith(const fs::path& path, std::string_view extension)
{
    std::string name = utf8Text(path.filename());
    if (name.size() <= extension.size()) {
        return false;
    }
    std::transform(name.begin(), name.end(), name.begin(), [](unsigned char c) { return std::tolower(c); });
    return name.compare(name.size() - extension.size(), extension.size(), extension) == 0;
}

// The folder a relative name such as "plan.xls" goes to.
void checkOutput(const fs::path& path, std::string_view option, std::string_view extension, std::string_view kind)
{
    const std::string shown = std::string(option) + " \"" + utf8Text(path) + "\": ";
    if (!endsWith(path, extension)) {
        throw UsageError(shown + "the name must end in " + std::string(extension) + " (" + std::string(kind) + ").");
    }
    std::error_code status;
    if (fs::is_directory(path, status)) {
        throw UsageError(shown + "that is a folder.");
    }
    const fs::path folder = folderOf(path);
    if (!fs::is_directory(folder, status)) {
        throw UsageError(shown + "the folder \"" + utf8Text(folder) + "\" does not exist.");
    }
}

} // namespace

fs::path folderOf(const fs::path& path)
{
    return path.has_parent_path() ? path.parent_path() : fs::path(".");
}

void checkOutputPaths(const BuildRequest& request)
{
    checkOutput(request.output, "-o", ".xls", "an Excel 97-2003 workbook");
    if (!request.picture) {
        return;
    }
    checkOutput(*request.picture, "--picture", ".png", "a PNG picture");
    std::error_code ignored;
    if (fs::weakly_canonical(request.output, ignored) == fs::weakly_canonical(*request.picture, ignored)) {
        throw UsageError("-o and --picture name the same file.");
    }
}

} // namespace penmoor
