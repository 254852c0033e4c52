#pragma once

#include "worksheet.h"

#include <cstdint>
#include <memory>
#include <string>

namespace xl {

class Workbook {
public:
    virtual ~Workbook() = default;

    // Writes the workbook as an .xls file at exactly this path, replacing a file there only
    // once the new one is complete.
    virtual void SaveAs(const std::string& path) = 0;
    // Closes the workbook without asking; its objects are no longer usable.
    virtual void Close() = 0;

    virtual std::unique_ptr<xl::Worksheet> ActiveSheet() = 0;
    virtual std::unique_ptr<xl::Sheets> Sheets() = 0;

    // Palette entry k, 1 to 56, as red + 256 * green + 65536 * blue.
    virtual std::uint32_t Colors(int k) const = 0;
    virtual void setColors(int k, std::uint32_t rgb) = 0;
};

// The open workbooks of an application.
class Workbooks {
public:
    virtual ~Workbooks() = default;

    // A new workbook with three sheets, Sheet1 to Sheet3, which becomes the active one.
    virtual std::unique_ptr<xl::Workbook> Add() = 0;
    // Opens an .xls file as the last workbook of the collection, which becomes the active one.
    virtual std::unique_ptr<xl::Workbook> Open(const std::string& path) = 0;
    virtual int count() const = 0;
    // 1-based
    virtual std::unique_ptr<xl::Workbook> Item(int index) = 0;
};

} // namespace xl
