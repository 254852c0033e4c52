// Any bytes as a compound file: every stream of the root storage is read or the file is refused
// with FormatError, and a Workbook stream found in it goes on to the BIFF8 reader.
#include "spreadsheet/xls/compoundfilereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/xlsreader.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    try {
        const penmoor::xls::CompoundFileReader reader({ data, size });
        for (const auto& entry : reader.entries())
            (void)reader.readStream(entry.name);
        (void)penmoor::xls::readXls({ data, size });
    } catch (const penmoor::xls::FormatError&) {
    }
    return 0;
}
