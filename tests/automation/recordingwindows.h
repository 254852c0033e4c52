#pragma once

#include "automation/mainwindow.h"
#include "automation/previewwindow.h"

#include <functional>
#include <string>
#include <vector>

namespace penmoor::testing {

// The two windows of a build, writing what is done to them into one shared log:
// "lock", "unlock", "pointer 11", "check", "show", "hide" for the main window and
// "preview picture 32x96", "preview path qarnet12345678.xls", "preview show" for the preview.
class RecordingMainWindow final : public MainWindow {
public:
    explicit RecordingMainWindow(std::vector<std::string>& log)
        : m_log(log)
    {
    }

    void lockDrawing() override { m_log.push_back("lock"); }
    void unlockDrawing() override { m_log.push_back("unlock"); }
    void setMousePointer(MousePointer pointer) override
    {
        m_log.push_back("pointer " + std::to_string(static_cast<int>(pointer)));
    }
    bool CheckPeriodOptions() override
    {
        m_log.push_back("check");
        return checkPeriodOptions ? checkPeriodOptions() : false;
    }
    void show() override { m_log.push_back("show"); }
    void hide() override { m_log.push_back("hide"); }

    // What CheckPeriodOptions does; by default it finds no problem.
    std::function<bool()> checkPeriodOptions;

private:
    std::vector<std::string>& m_log;
};

class RecordingPreview final : public PreviewWindow {
public:
    explicit RecordingPreview(std::vector<std::string>& log)
        : m_log(log)
    {
    }

    void setPicture(xl::Picture given) override
    {
        m_log.push_back("preview picture " + std::to_string(given.width) + "x" + std::to_string(given.height));
        picture = std::move(given);
    }
    void setTempWorkbookPath(const std::filesystem::path& path) override
    {
        m_log.push_back("preview path " + path.filename().string());
        tempWorkbookPath = path;
    }
    void show() override { m_log.push_back("preview show"); }

    xl::Picture picture;
    std::filesystem::path tempWorkbookPath;

private:
    std::vector<std::string>& m_log;
};

} // namespace penmoor::testing
