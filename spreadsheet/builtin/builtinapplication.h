#pragma once

#include "automation/contract/application.h"
#include "spreadsheet/builtin/picturerenderer.h"

#include <memory>

namespace penmoor::engine {

struct ApplicationState;

// The spreadsheet application built into the program: the whole contract of
// automation/contract/, in memory, with the object model's select-then-act manner.
class BuiltinApplication : public xl::Application {
public:
    // Without a renderer, CopyPicture raises xl::Error.
    explicit BuiltinApplication(std::shared_ptr<PictureRenderer> renderer = nullptr);
    ~BuiltinApplication() override;

    std::string Value() const override;

    bool Visible() const override;
    void setVisible(bool visible) override;
    bool ScreenUpdating() const override;
    void setScreenUpdating(bool on) override;
    bool DisplayAlerts() const override;
    void setDisplayAlerts(bool on) override;
    bool EnableEvents() const override;
    void setEnableEvents(bool on) override;
    int EnableCancelKey() const override;
    void setEnableCancelKey(int mode) override;
    int Cursor() const override;
    void setCursor(int cursor) override;

    std::unique_ptr<xl::Workbooks> Workbooks() override;
    std::unique_ptr<xl::Sheets> Sheets() override;

    std::unique_ptr<xl::Range> Range(const std::string& address) override;
    std::unique_ptr<xl::Range> Rows(const std::string& address) override;
    std::unique_ptr<xl::Range> Columns(const std::string& address) override;
    std::unique_ptr<xl::Range> Cells() override;
    std::unique_ptr<xl::Range> Selection() override;
    std::unique_ptr<xl::Range> ActiveCell() override;
    std::unique_ptr<xl::Workbook> ActiveWorkbook() override;
    std::unique_ptr<xl::Worksheet> ActiveSheet() override;

    double InchesToPoints(double inches) const override;
    void Quit() override;

private:
    const ApplicationState& state() const;
    ApplicationState& state();

    std::shared_ptr<ApplicationState> m_state;
};

// Makes built-in applications. An instance lives only inside the build that made it, so there
// is never a running one to attach to.
class BuiltinApplicationFactory : public xl::ApplicationFactory {
public:
    explicit BuiltinApplicationFactory(std::shared_ptr<PictureRenderer> renderer = nullptr);

    std::unique_ptr<xl::Application> create() override;
    std::unique_ptr<xl::Application> attachRunning() override;

private:
    std::shared_ptr<PictureRenderer> m_renderer;
};

} // namespace penmoor::engine
