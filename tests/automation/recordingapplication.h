#pragma once

#include "automation/contract/application.h"
#include "spreadsheet/builtin/picturerenderer.h"

#include <memory>
#include <set>
#include <string>
#include <vector>

namespace penmoor::testing {

// Draws a block as a plain picture of 2 x 2 pixels per cell, so that the build's picture
// steps run without a painter. The pixel colour encodes the block's size for checks.
class BlockPictureRenderer final : public engine::PictureRenderer {
public:
    xl::Picture renderPicture(
        const engine::Workbook& workbook, const engine::Sheet& sheet, const engine::Region& block) override;
};

// What the recording applications write down and how they misbehave on request.
struct Recorder {
    // Every recorded operation in order: "create", "attachRunning", the switches written
    // ("Visible=False", "EnableCancelKey=0", "Cursor=2"), "Workbooks.Add", "Workbooks.Open
    // <file name>", "Sheets(2).Delete", "Sheets(1).Name=CashFlow", "Sheets(1).Select",
    // "SaveAs <file name>", "Close", "Quit".
    std::vector<std::string> log;
    // Operations that fail with "<operation> failed on purpose." instead of running, named by
    // the log text before any "=" or blank: "create", "Workbooks.Open", "Sheets(2).Delete".
    std::set<std::string> failing;
    // How many sheets a new workbook comes with.
    int sheetsInNewWorkbook = 3;
    // The default value of the running instance; empty: none is running.
    std::string runningValue;
};

// Built-in applications wrapped so that the application-level operations a build performs
// (switches, workbooks, sheets, save, close, quit) are recorded; ranges pass straight through.
class RecordingFactory final : public xl::ApplicationFactory {
public:
    RecordingFactory();

    std::unique_ptr<xl::Application> create() override;
    std::unique_ptr<xl::Application> attachRunning() override;

    Recorder& recorder() { return *m_recorder; }
    const std::vector<std::string>& log() const { return m_recorder->log; }

private:
    std::shared_ptr<Recorder> m_recorder;
    std::shared_ptr<engine::PictureRenderer> m_renderer;
};

} // namespace penmoor::testing
