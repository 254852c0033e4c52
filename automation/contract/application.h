#pragma once

#include "workbook.h"

#include <memory>
#include <string>

namespace xl {

// The spreadsheet application, as the program drives it: switches, the active workbook and
// sheet, and ranges of the active sheet by A1 address ("C5", "B4:P51", "1:1", "A:A").
// Every failure raises xl::Error; after Quit every call fails.
class Application {
public:
    virtual ~Application() = default;

    // The application's default value, its name.
    virtual std::string Value() const = 0;

    virtual bool Visible() const = 0;
    virtual void setVisible(bool visible) = 0;
    virtual bool ScreenUpdating() const = 0;
    virtual void setScreenUpdating(bool on) = 0;
    virtual bool DisplayAlerts() const = 0;
    virtual void setDisplayAlerts(bool on) = 0;
    virtual bool EnableEvents() const = 0;
    virtual void setEnableEvents(bool on) = 0;
    // kCancelKeyDisabled, kCancelKeyInterrupt or kCancelKeyErrorHandler
    virtual int EnableCancelKey() const = 0;
    virtual void setEnableCancelKey(int mode) = 0;
    // kCursorDefault, kCursorWait, ...
    virtual int Cursor() const = 0;
    virtual void setCursor(int cursor) = 0;

    virtual std::unique_ptr<xl::Workbooks> Workbooks() = 0;
    // The sheets of the active workbook.
    virtual std::unique_ptr<xl::Sheets> Sheets() = 0;

    virtual std::unique_ptr<xl::Range> Range(const std::string& address) = 0;
    virtual std::unique_ptr<xl::Range> Rows(const std::string& address) = 0;
    virtual std::unique_ptr<xl::Range> Columns(const std::string& address) = 0;
    // The whole active sheet.
    virtual std::unique_ptr<xl::Range> Cells() = 0;
    virtual std::unique_ptr<xl::Range> Selection() = 0;
    virtual std::unique_ptr<xl::Range> ActiveCell() = 0;
    virtual std::unique_ptr<xl::Workbook> ActiveWorkbook() = 0;
    virtual std::unique_ptr<xl::Worksheet> ActiveSheet() = 0;

    virtual double InchesToPoints(double inches) const = 0;
    // Ends the application; open workbooks are closed without saving.
    virtual void Quit() = 0;
};

// Where application objects come from: a new instance, or the one already running.
class ApplicationFactory {
public:
    virtual ~ApplicationFactory() = default;

    // A new instance; raises xl::Error when none can be created.
    virtual std::unique_ptr<xl::Application> create() = 0;
    // The running instance; raises xl::Error when there is none.
    virtual std::unique_ptr<xl::Application> attachRunning() = 0;
};

} // namespace xl
