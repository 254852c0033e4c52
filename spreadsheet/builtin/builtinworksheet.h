#pragma once

#include "automation/contract/worksheet.h"
#include "spreadsheet/builtin/session.h"

namespace penmoor::engine {

class BuiltinWorksheet : public xl::Worksheet {
public:
    explicit BuiltinWorksheet(SheetHandle sheet);

    std::string Name() const override;
    void setName(const std::string& name) override;
    void Select() override;
    void Delete() override;
    std::unique_ptr<xl::Range> UsedRange() override;
    std::unique_ptr<xl::PageSetup> PageSetup() override;

private:
    SheetHandle m_sheet;
};

class BuiltinSheets : public xl::Sheets {
public:
    explicit BuiltinSheets(WorkbookHandle workbook);

    int count() const override;
    std::unique_ptr<xl::Worksheet> Item(int index) override;

private:
    WorkbookHandle m_workbook;
};

} // namespace penmoor::engine
