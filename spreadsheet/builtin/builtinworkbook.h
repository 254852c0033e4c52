#pragma once

#include "automation/contract/workbook.h"
#include "spreadsheet/builtin/session.h"

namespace penmoor::engine {

class BuiltinWorkbook : public xl::Workbook {
public:
    explicit BuiltinWorkbook(WorkbookHandle workbook);

    void SaveAs(const std::string& path) override;
    void Close() override;
    std::unique_ptr<xl::Worksheet> ActiveSheet() override;
    std::unique_ptr<xl::Sheets> Sheets() override;
    std::uint32_t Colors(int k) const override;
    void setColors(int k, std::uint32_t rgb) override;

private:
    WorkbookHandle m_workbook;
};

class BuiltinWorkbooks : public xl::Workbooks {
public:
    explicit BuiltinWorkbooks(std::shared_ptr<ApplicationState> application);

    std::unique_ptr<xl::Workbook> Add() override;
    std::unique_ptr<xl::Workbook> Open(const std::string& path) override;
    int count() const override;
    std::unique_ptr<xl::Workbook> Item(int index) override;

private:
    std::shared_ptr<ApplicationState> m_application;
};

// Closes a workbook of the application: its objects stop working and another open workbook,
// if any, becomes the active one.
void closeDocument(ApplicationState& application, const std::shared_ptr<Document>& document);

} // namespace penmoor::engine
