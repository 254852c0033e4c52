#include "report/itemreferences.h"

#include "automation/contract/error.h"

namespace penmoor {

namespace {

int sheetRowAt(const Options& options, int position)
{
    if (position < 1 || position > options.count()) {
        throw xl::Error("There is no item " + std::to_string(position) + " in the item list, which holds "
            + std::to_string(options.count()) + " items.");
    }
    return options.item(position).sheetRow;
}

} // namespace

int RowOffset(const Options& options, int target, int current)
{
    return sheetRowAt(options, target) - sheetRowAt(options, current);
}

std::string RelativeRef(const Options& options, int target, int current, int columnOffset)
{
    return relativeReference(RowOffset(options, target, current), columnOffset);
}

std::string relativeReference(int rowOffset, int columnOffset)
{
    return "R[" + std::to_string(rowOffset) + "]C[" + std::to_string(columnOffset) + "]";
}

} // namespace penmoor
