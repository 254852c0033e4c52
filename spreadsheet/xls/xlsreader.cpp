#include "spreadsheet/xls/xlsreader.h"

#include "automation/contract/error.h"
#include "spreadsheet/xls/compoundfilereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/globalsreader.h"
#include "spreadsheet/xls/sheetreader.h"
#include "spreadsheet/xls/unicode.h"

#include <set>

namespace penmoor::xls {

namespace {

std::vector<std::uint8_t> workbookStream(std::span<const std::uint8_t> file)
{
    const CompoundFileReader container(file);
    if (auto stream = container.readStream(u"Workbook"))
        return std::move(*stream);
    if (container.readStream(u"Book"))
        throw FormatError("it is an Excel 5 or 95 workbook, an older format that is not supported");
    throw FormatError("the file holds no workbook stream");
}

} // namespace

engine::Workbook readXls(std::span<const std::uint8_t> file)
{
    return readWorkbookStream(workbookStream(file));
}

engine::Workbook readWorkbookStream(std::span<const std::uint8_t> stream)
{
    WorkbookGlobals globals(stream);
    if (globals.worksheets().empty())
        throw FormatError("the workbook has no worksheet");

    engine::Workbook book;
    if (const auto palette = globals.palette()) {
        for (int k = 1; k <= engine::kPaletteSize; ++k)
            book.setColor(k, (*palette)[static_cast<std::size_t>(k - 1)]);
    }
    std::set<std::uint32_t> positions;
    std::optional<int> active = globals.activeWorksheet();
    for (std::size_t index = 0; index < globals.worksheets().size(); ++index) {
        const SheetEntry& entry = globals.worksheets()[index];
        if (!positions.insert(entry.position).second)
            throw FormatError("two sheets start at the same position");
        engine::Sheet* sheet = nullptr;
        try {
            sheet = &book.addSheet(utf16ToUtf8(entry.name));
        } catch (const xl::Error& error) {
            throw FormatError("a sheet name is not allowed: " + std::string(error.what()));
        }
        const bool marked = readSheet(stream, entry.position, globals, book, *sheet);
        if (marked && !active)
            active = static_cast<int>(index);
    }
    for (const auto& [index, area] : globals.printAreas()) {
        const engine::Region region { area.firstRow + 1, area.firstColumn + 1, area.lastRow + 1, area.lastColumn + 1 };
        if (region.isValid())
            book.sheet(index).pageSetup().printArea = region;
    }
    book.setActiveSheet(active.value_or(0));
    return book;
}

} // namespace penmoor::xls
