#include "tests/automation/recordingapplication.h"

#include "automation/contract/error.h"
#include "spreadsheet/builtin/builtinapplication.h"

#include <filesystem>

namespace penmoor::testing {

namespace {

using RecorderPointer = std::shared_ptr<Recorder>;

const char* flag(bool on)
{
    return on ? "True" : "False";
}

std::string fileName(const std::string& path)
{
    return std::filesystem::path(std::u8string(path.begin(), path.end())).filename().string();
}

// Records the operation, or fails it when the test asked for that.
void record(Recorder& recorder, const std::string& entry)
{
    const std::string operation = entry.substr(0, entry.find_first_of("= "));
    if (recorder.failing.count(operation) != 0) {
        recorder.log.push_back(entry + " (failed)");
        throw xl::Error(operation + " failed on purpose.");
    }
    recorder.log.push_back(entry);
}

class RecordingWorksheet final : public xl::Worksheet {
public:
    RecordingWorksheet(std::unique_ptr<xl::Worksheet> inner, RecorderPointer recorder, std::string label)
        : m_inner(std::move(inner))
        , m_recorder(std::move(recorder))
        , m_label(std::move(label))
    {
    }

    std::string Name() const override { return m_inner->Name(); }
    void setName(const std::string& name) override
    {
        record(*m_recorder, m_label + ".Name=" + name);
        m_inner->setName(name);
    }
    void Select() override
    {
        record(*m_recorder, m_label + ".Select");
        m_inner->Select();
    }
    void Delete() override
    {
        record(*m_recorder, m_label + ".Delete");
        m_inner->Delete();
    }
    std::unique_ptr<xl::Range> UsedRange() override { return m_inner->UsedRange(); }
    std::unique_ptr<xl::PageSetup> PageSetup() override { return m_inner->PageSetup(); }

private:
    std::unique_ptr<xl::Worksheet> m_inner;
    RecorderPointer m_recorder;
    std::string m_label;
};

class RecordingSheets final : public xl::Sheets {
public:
    RecordingSheets(std::unique_ptr<xl::Sheets> inner, RecorderPointer recorder)
        : m_inner(std::move(inner))
        , m_recorder(std::move(recorder))
    {
    }

    int count() const override { return m_inner->count(); }
    std::unique_ptr<xl::Worksheet> Item(int index) override
    {
        return std::make_unique<RecordingWorksheet>(
            m_inner->Item(index), m_recorder, "Sheets(" + std::to_string(index) + ")");
    }

private:
    std::unique_ptr<xl::Sheets> m_inner;
    RecorderPointer m_recorder;
};

class RecordingWorkbook final : public xl::Workbook {
public:
    RecordingWorkbook(std::unique_ptr<xl::Workbook> inner, RecorderPointer recorder)
        : m_inner(std::move(inner))
        , m_recorder(std::move(recorder))
    {
    }

    void SaveAs(const std::string& path) override
    {
        record(*m_recorder, "SaveAs " + fileName(path));
        m_inner->SaveAs(path);
    }
    void Close() override
    {
        record(*m_recorder, "Close");
        m_inner->Close();
    }
    std::unique_ptr<xl::Worksheet> ActiveSheet() override
    {
        return std::make_unique<RecordingWorksheet>(m_inner->ActiveSheet(), m_recorder, "ActiveSheet");
    }
    std::unique_ptr<xl::Sheets> Sheets() override
    {
        return std::make_unique<RecordingSheets>(m_inner->Sheets(), m_recorder);
    }
    std::uint32_t Colors(int k) const override { return m_inner->Colors(k); }
    void setColors(int k, std::uint32_t rgb) override { m_inner->setColors(k, rgb); }

private:
    std::unique_ptr<xl::Workbook> m_inner;
    RecorderPointer m_recorder;
};

class RecordingWorkbooks final : public xl::Workbooks {
public:
    RecordingWorkbooks(std::unique_ptr<xl::Workbooks> inner, RecorderPointer recorder)
        : m_inner(std::move(inner))
        , m_recorder(std::move(recorder))
    {
    }

    std::unique_ptr<xl::Workbook> Add() override
    {
        record(*m_recorder, "Workbooks.Add");
        std::unique_ptr<xl::Workbook> added = m_inner->Add();
        // Fewer sheets than the built-in three, as some installations are set up.
        const std::unique_ptr<xl::Sheets> sheets = added->Sheets();
        while (sheets->count() > m_recorder->sheetsInNewWorkbook) {
            sheets->Item(sheets->count())->Delete();
        }
        return std::make_unique<RecordingWorkbook>(std::move(added), m_recorder);
    }
    std::unique_ptr<xl::Workbook> Open(const std::string& path) override
    {
        record(*m_recorder, "Workbooks.Open " + fileName(path));
        return std::make_unique<RecordingWorkbook>(m_inner->Open(path), m_recorder);
    }
    int count() const override { return m_inner->count(); }
    std::unique_ptr<xl::Workbook> Item(int index) override
    {
        return std::make_unique<RecordingWorkbook>(m_inner->Item(index), m_recorder);
    }

private:
    std::unique_ptr<xl::Workbooks> m_inner;
    RecorderPointer m_recorder;
};

class RecordingApplication final : public xl::Application {
public:
    RecordingApplication(std::unique_ptr<xl::Application> inner, RecorderPointer recorder, std::string value)
        : m_inner(std::move(inner))
        , m_recorder(std::move(recorder))
        , m_value(std::move(value))
    {
    }

    std::string Value() const override
    {
        record(*m_recorder, "Value");
        return m_value;
    }

    bool Visible() const override { return m_inner->Visible(); }
    void setVisible(bool visible) override
    {
        record(*m_recorder, std::string("Visible=") + flag(visible));
        m_inner->setVisible(visible);
    }
    bool ScreenUpdating() const override { return m_inner->ScreenUpdating(); }
    void setScreenUpdating(bool on) override
    {
        record(*m_recorder, std::string("ScreenUpdating=") + flag(on));
        m_inner->setScreenUpdating(on);
    }
    bool DisplayAlerts() const override { return m_inner->DisplayAlerts(); }
    void setDisplayAlerts(bool on) override
    {
        record(*m_recorder, std::string("DisplayAlerts=") + flag(on));
        m_inner->setDisplayAlerts(on);
    }
    bool EnableEvents() const override { return m_inner->EnableEvents(); }
    void setEnableEvents(bool on) override
    {
        record(*m_recorder, std::string("EnableEvents=") + flag(on));
        m_inner->setEnableEvents(on);
    }
    int EnableCancelKey() const override { return m_inner->EnableCancelKey(); }
    void setEnableCancelKey(int mode) override
    {
        record(*m_recorder, "EnableCancelKey=" + std::to_string(mode));
        m_inner->setEnableCancelKey(mode);
    }
    int Cursor() const override { return m_inner->Cursor(); }
    void setCursor(int cursor) override
    {
        record(*m_recorder, "Cursor=" + std::to_string(cursor));
        m_inner->setCursor(cursor);
    }

    std::unique_ptr<xl::Workbooks> Workbooks() override
    {
        return std::make_unique<RecordingWorkbooks>(m_inner->Workbooks(), m_recorder);
    }
    std::unique_ptr<xl::Sheets> Sheets() override
    {
        return std::make_unique<RecordingSheets>(m_inner->Sheets(), m_recorder);
    }

    std::unique_ptr<xl::Range> Range(const std::string& address) override { return m_inner->Range(address); }
    std::unique_ptr<xl::Range> Rows(const std::string& address) override { return m_inner->Rows(address); }
    std::unique_ptr<xl::Range> Columns(const std::string& address) override { return m_inner->Columns(address); }
    std::unique_ptr<xl::Range> Cells() override { return m_inner->Cells(); }
    std::unique_ptr<xl::Range> Selection() override { return m_inner->Selection(); }
    std::unique_ptr<xl::Range> ActiveCell() override { return m_inner->ActiveCell(); }
    std::unique_ptr<xl::Workbook> ActiveWorkbook() override
    {
        return std::make_unique<RecordingWorkbook>(m_inner->ActiveWorkbook(), m_recorder);
    }
    std::unique_ptr<xl::Worksheet> ActiveSheet() override
    {
        return std::make_unique<RecordingWorksheet>(m_inner->ActiveSheet(), m_recorder, "ActiveSheet");
    }

    double InchesToPoints(double inches) const override { return m_inner->InchesToPoints(inches); }
    void Quit() override
    {
        record(*m_recorder, "Quit");
        m_inner->Quit();
    }

private:
    std::unique_ptr<xl::Application> m_inner;
    RecorderPointer m_recorder;
    std::string m_value;
};

} // namespace

xl::Picture BlockPictureRenderer::renderPicture(
    const engine::Workbook&, const engine::Sheet&, const engine::Region& block)
{
    xl::Picture picture;
    picture.width = 2 * (block.lastColumn - block.firstColumn + 1);
    picture.height = 2 * (block.lastRow - block.firstRow + 1);
    picture.pixels.assign(static_cast<std::size_t>(picture.width) * static_cast<std::size_t>(picture.height),
        0xFF000000u | static_cast<std::uint32_t>(block.lastRow << 8 | block.lastColumn));
    return picture;
}

RecordingFactory::RecordingFactory()
    : m_recorder(std::make_shared<Recorder>())
    , m_renderer(std::make_shared<BlockPictureRenderer>())
{
}

std::unique_ptr<xl::Application> RecordingFactory::create()
{
    record(*m_recorder, "create");
    return std::make_unique<RecordingApplication>(
        std::make_unique<engine::BuiltinApplication>(m_renderer), m_recorder, "Penmoor spreadsheet");
}

std::unique_ptr<xl::Application> RecordingFactory::attachRunning()
{
    record(*m_recorder, "attachRunning");
    if (m_recorder->runningValue.empty()) {
        throw xl::Error("No spreadsheet application is running.");
    }
    return std::make_unique<RecordingApplication>(
        std::make_unique<engine::BuiltinApplication>(m_renderer), m_recorder, m_recorder->runningValue);
}

} // namespace penmoor::testing
