#include "spreadsheet/builtin/builtinapplication.h"

#include "automation/contract/error.h"
#include "spreadsheet/builtin/builtinrange.h"
#include "spreadsheet/builtin/builtinworkbook.h"
#include "spreadsheet/builtin/builtinworksheet.h"
#include "spreadsheet/builtin/session.h"

#include <algorithm>
#include <array>

namespace penmoor::engine {

namespace {

constexpr std::array kCursors { xl::kCursorDefault, xl::kCursorNorthwestArrow, xl::kCursorWait, xl::kCursorIBeam };

} // namespace

BuiltinApplication::BuiltinApplication(std::shared_ptr<PictureRenderer> renderer)
    : m_state(std::make_shared<ApplicationState>())
{
    m_state->renderer = std::move(renderer);
}

BuiltinApplication::~BuiltinApplication() = default;

const ApplicationState& BuiltinApplication::state() const
{
    m_state->checkRunning();
    return *m_state;
}

ApplicationState& BuiltinApplication::state()
{
    m_state->checkRunning();
    return *m_state;
}

std::string BuiltinApplication::Value() const
{
    state();
    return "Penmoor spreadsheet";
}

bool BuiltinApplication::Visible() const
{
    return state().visible;
}
void BuiltinApplication::setVisible(bool visible)
{
    state().visible = visible;
}
bool BuiltinApplication::ScreenUpdating() const
{
    return state().screenUpdating;
}
void BuiltinApplication::setScreenUpdating(bool on)
{
    state().screenUpdating = on;
}
bool BuiltinApplication::DisplayAlerts() const
{
    return state().displayAlerts;
}
void BuiltinApplication::setDisplayAlerts(bool on)
{
    state().displayAlerts = on;
}
bool BuiltinApplication::EnableEvents() const
{
    return state().enableEvents;
}
void BuiltinApplication::setEnableEvents(bool on)
{
    state().enableEvents = on;
}
int BuiltinApplication::EnableCancelKey() const
{
    return state().enableCancelKey;
}

void BuiltinApplication::setEnableCancelKey(int mode)
{
    if (mode != xl::kCancelKeyDisabled && mode != xl::kCancelKeyInterrupt && mode != xl::kCancelKeyErrorHandler)
        throw xl::Error("The cancel key mode " + std::to_string(mode) + " is not one of 0, 1 and 2.");
    state().enableCancelKey = mode;
}

int BuiltinApplication::Cursor() const
{
    return state().cursor;
}

void BuiltinApplication::setCursor(int cursor)
{
    if (std::find(kCursors.begin(), kCursors.end(), cursor) == kCursors.end())
        throw xl::Error("The cursor " + std::to_string(cursor) + " is not supported.");
    state().cursor = cursor;
}

std::unique_ptr<xl::Workbooks> BuiltinApplication::Workbooks()
{
    state();
    return std::make_unique<BuiltinWorkbooks>(m_state);
}

std::unique_ptr<xl::Sheets> BuiltinApplication::Sheets()
{
    return std::make_unique<BuiltinSheets>(activeWorkbook(m_state));
}

std::unique_ptr<xl::Range> BuiltinApplication::Range(const std::string& address)
{
    SheetHandle sheet = activeSheet(m_state);
    return std::make_unique<BuiltinRange>(std::move(sheet), parseAddress(address));
}

std::unique_ptr<xl::Range> BuiltinApplication::Rows(const std::string& address)
{
    SheetHandle sheet = activeSheet(m_state);
    return std::make_unique<BuiltinRange>(std::move(sheet), parseRowsAddress(address), BuiltinRange::Collection::Rows);
}

std::unique_ptr<xl::Range> BuiltinApplication::Columns(const std::string& address)
{
    SheetHandle sheet = activeSheet(m_state);
    return std::make_unique<BuiltinRange>(
        std::move(sheet), parseColumnsAddress(address), BuiltinRange::Collection::Columns);
}

std::unique_ptr<xl::Range> BuiltinApplication::Cells()
{
    return std::make_unique<BuiltinRange>(activeSheet(m_state), Region::wholeSheet());
}

std::unique_ptr<xl::Range> BuiltinApplication::Selection()
{
    SheetHandle sheet = activeSheet(m_state);
    const Region selection = sheet.sheet().selection();
    return std::make_unique<BuiltinRange>(std::move(sheet), selection);
}

std::unique_ptr<xl::Range> BuiltinApplication::ActiveCell()
{
    SheetHandle sheet = activeSheet(m_state);
    const CellPosition cell = sheet.sheet().activeCell();
    return std::make_unique<BuiltinRange>(std::move(sheet), Region::cell(cell));
}

std::unique_ptr<xl::Workbook> BuiltinApplication::ActiveWorkbook()
{
    return std::make_unique<BuiltinWorkbook>(activeWorkbook(m_state));
}

std::unique_ptr<xl::Worksheet> BuiltinApplication::ActiveSheet()
{
    return std::make_unique<BuiltinWorksheet>(activeSheet(m_state));
}

double BuiltinApplication::InchesToPoints(double inches) const
{
    state();
    return inches * xl::kPointsPerInch;
}

void BuiltinApplication::Quit()
{
    ApplicationState& application = state();
    while (!application.documents.empty())
        closeDocument(application, application.documents.back());
    application.running = false;
}

BuiltinApplicationFactory::BuiltinApplicationFactory(std::shared_ptr<PictureRenderer> renderer)
    : m_renderer(std::move(renderer))
{
}

std::unique_ptr<xl::Application> BuiltinApplicationFactory::create()
{
    return std::make_unique<BuiltinApplication>(m_renderer);
}

std::unique_ptr<xl::Application> BuiltinApplicationFactory::attachRunning()
{
    throw xl::Error("No spreadsheet application is running: the built-in one lives only inside a build.");
}

} // namespace penmoor::engine
