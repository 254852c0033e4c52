// Any bytes as a Workbook stream: the reader builds a workbook or raises FormatError; anything
// else (a crash, another exception, a sanitizer report, a hang) is a fault.
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/xlsreader.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    try {
        (void)penmoor::xls::readWorkbookStream({ data, size });
    } catch (const penmoor::xls::FormatError&) {
    }
    return 0;
}
