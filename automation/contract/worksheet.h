#pragma once

#include "pagesetup.h"
#include "range.h"

#include <memory>
#include <string>

namespace xl {

class Worksheet {
public:
    virtual ~Worksheet() = default;

    virtual std::string Name() const = 0;
    // 1 to 31 characters, none of : \ / ? * [ ], unique in the workbook (letter case ignored).
    virtual void setName(const std::string& name) = 0;
    // Makes the sheet the active sheet of its workbook.
    virtual void Select() = 0;
    // Removes the sheet without asking; the last sheet of a workbook cannot be deleted.
    virtual void Delete() = 0;

    // From the first to the last row and column that hold a value, a format of their own, or
    // a row height or column width that was set; A1 alone on an empty sheet.
    virtual std::unique_ptr<xl::Range> UsedRange() = 0;
    virtual std::unique_ptr<xl::PageSetup> PageSetup() = 0;
};

// The worksheets of a workbook.
class Sheets {
public:
    virtual ~Sheets() = default;

    virtual int count() const = 0;
    // 1-based
    virtual std::unique_ptr<xl::Worksheet> Item(int index) = 0;
};

} // namespace xl
