#include "app/buildtool/commandline.h"

#include "app/buildtool/itemsfile.h"
#include "app/buildtool/outputpaths.h"
#include "app/buildtool/periodchecks.h"
#include "app/buildtool/utf8text.h"
#include "model/defaultlist.h"
#include "model/itemrules.h"
#include "shell/fileutils.h"

#include <algorithm>
#include <set>

namespace penmoor {

namespace {

struct Option {
    std::string_view name;
    int valueCount;
};

constexpr Option kOptions[] = {
    { "--company", 1 },
    { "--by-year", 2 },
    { "--by-month", 2 },
    { "--by-week", 1 },
    { "--items", 1 },
    { "--picture", 1 },
    { "-o", 1 },
};

const Option* findOption(std::string_view name)
{
    const auto found
        = std::find_if(std::begin(kOptions), std::end(kOptions), [&](const Option& o) { return o.name == name; });
    return found == std::end(kOptions) ? nullptr : found;
}

bool isModeOption(std::string_view name)
{
    return name == "--by-year" || name == "--by-month" || name == "--by-week";
}

void applyOption(BuildRequest& request, std::string_view name, const std::vector<std::string>& values)
{
    if (name == "--company") {
        if (!isWellFormedUtf8(values[0])) {
            throw UsageError("--company: the name is not UTF-8 text.");
        }
        if (values[0].size() > kLongestCellText) {
            throw UsageError("--company: the name is longer than a cell can hold.");
        }
        request.company = values[0];
    } else if (name == "--by-year" || name == "--by-month") {
        request.mode = name == "--by-year" ? PeriodMode::ByYear : PeriodMode::ByMonth;
        request.firstYear = checkedYear(values[0], name);
        request.lastYear = checkedYear(values[1], name);
        checkYearSpan(request.firstYear, request.lastYear, request.mode, name);
    } else if (name == "--by-week") {
        request.mode = PeriodMode::ByWeek;
        request.weeks = checkedWeeks(values[0], name);
    } else if (name == "--items") {
        request.items = readItemsFile(pathFromUtf8(values[0]));
    } else if (name == "--picture") {
        request.picture = pathFromUtf8(values[0]);
    } else {
        request.output = pathFromUtf8(values[0]);
    }
}

// The system rows as the help lists them, in their default order, a few to a line.
std::string systemRowList()
{
    std::string list;
    std::string line;
    for (const std::string_view name : kDefaultItemNames) {
        if (!IsSystemItem(name)) {
            continue;
        }
        if (!line.empty() && line.size() + name.size() > 80) {
            list += line + ",\n";
            line.clear();
        }
        line += (line.empty() ? "  " : ", ") + std::string(name);
    }
    return list + line + "\n";
}

} // namespace

CommandLine parseCommandLine(const std::vector<std::string>& arguments, int currentYear)
{
    CommandLine result;
    if (std::find(arguments.begin(), arguments.end(), "--help") != arguments.end()) {
        result.helpWanted = true;
        return result;
    }
    BuildRequest& request = result.request;
    request.firstYear = currentYear;
    request.lastYear = currentYear;

    std::set<std::string_view> given;
    std::string_view mode;
    for (std::size_t i = 0; i < arguments.size();) {
        const std::string& name = arguments[i];
        const Option* option = findOption(name);
        if (!option) {
            throw UsageError(
                name.starts_with("-") ? "unknown option \"" + name + "\"." : "unexpected argument \"" + name + "\".");
        }
        if (!given.insert(option->name).second) {
            throw UsageError(name + " is given twice.");
        }
        if (isModeOption(name)) {
            if (!mode.empty()) {
                throw UsageError("choose one of --by-year, --by-month and --by-week, not " + std::string(mode) + " and "
                    + name + ".");
            }
            mode = option->name;
        }
        const std::size_t count = static_cast<std::size_t>(option->valueCount);
        if (arguments.size() - i - 1 < count) {
            throw UsageError(name + " needs " + (count == 1 ? "a value." : std::to_string(count) + " values."));
        }
        applyOption(request, name,
            { arguments.begin() + static_cast<std::ptrdiff_t>(i + 1),
                arguments.begin() + static_cast<std::ptrdiff_t>(i + 1 + count) });
        i += 1 + count;
    }
    if (given.count("-o") == 0) {
        throw UsageError("-o is missing: name the workbook to write, such as -o plan.xls.");
    }
    checkOutputPaths(request);
    return result;
}

std::string usageText()
{
    return R"(Usage: penmoor-build [--company TEXT]
                     [--by-year FIRST LAST | --by-month FIRST LAST | --by-week N]
                     [--items FILE] [--picture FILE.png] -o OUT.xls

Builds the cash-flow planning workbook exactly as Penmoor's "Start Creating Template" does,
without a window, and writes it as an Excel 97-2003 workbook (.xls).

Options:
  --company TEXT         The company name in the title block (UTF-8). Default: none.
  --by-year FIRST LAST   One column per year from FIRST to LAST.
  --by-month FIRST LAST  One column per month from January of FIRST to December of LAST.
                         This is the default, over the current year.
  --by-week N            N columns, Week 1 to Week N.
  --items FILE           The item list: UTF-8 text, one item name per line, each line taken
                         exactly as it stands (blanks included). Lines may end in LF or CR LF;
                         a final line break adds no item. Default: the 44 items of the
                         default list.
  --picture FILE.png     Also write a PNG picture of the sheet, as the preview shows it.
  -o OUT.xls             Where the workbook goes. Required. An existing file is replaced.
  --help                 Show this text and do nothing else.

Years are whole numbers from 1970 to 9999; 0 to 99 stand for 2000 to 2099. The last year
may not come before the first, and may be at most 100 years after it (10 with --by-month).
Weeks are 1 to 100. In the item list every name has at least 3 characters and no two names
match (names match when they are equal after the first "&" of each is removed); the eight
system rows must be present, written exactly, in this order:
)" + systemRowList()
        + R"(
Input that breaks these rules is refused before anything is written: no file appears.
The output folders must exist.

Exit status:
  0  the workbook (and the picture) were written
  1  the build failed; the reason is on standard error and no file was written
  2  the input was refused; the problem is on standard error and no file was written
)";
}

} // namespace penmoor
