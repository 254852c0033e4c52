#pragma once

#include "automation/mainwindow.h"
#include "automation/previewwindow.h"
#include "shell/dialogs.h"
#include "ui/preview/previewgeometry.h"

#include <filesystem>
#include <functional>
#include <string_view>

#include <QCursor>
#include <QImage>
#include <QWidget>

class QGroupBox;
class QPushButton;
class QScrollBar;

namespace penmoor {

class PictureBox;

// The preview window: the picture of the last build with zoom, scroll bars and dragging, the
// save of its workbook and the way back to the main window. It owns the temporary workbook
// from the hand-over on and deletes it when the user goes back or closes the window. Closing
// it ends the program, after the settings have been written as closing the main window
// writes them.
class Form2 : public QWidget, public PreviewWindow {
    Q_OBJECT

public:
    // Writes the settings exactly as the main window's close does. What it throws is shown to
    // the user, and the program ends all the same.
    using SettingsWriter = std::function<void()>;

    static constexpr int kClientWidth = 656;
    static constexpr int kClientHeight = 626;

    // The main window, the dialogs and the writer must outlive the window. programFolder is
    // where the optional pointer file is looked for.
    Form2(MainWindow& mainWindow, Dialogs& dialogs, SettingsWriter writeSettings,
        const std::filesystem::path& programFolder, QWidget* parent = nullptr);

    // The hand-over of a build. Each new picture is set up afresh: zoom 1.0, top left corner.
    void setPicture(xl::Picture picture) override;
    void setTempWorkbookPath(const std::filesystem::path& path) override;
    void show() override;

    const std::filesystem::path& TempWorkbookPath() const { return m_tempWorkbookPath; }

protected:
    void closeEvent(QCloseEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void createControls();
    void connectControls();

    void zoomClicked(ZoomDirection direction, std::string_view location);
    void ZoomBy(ZoomDirection direction);
    void PushButton6_Click();
    void PushButton8_Click();

    void showPicture(const QImage& picture);
    // Puts the geometry on the screen: Picture1's size and place, the bars' ranges and values.
    void showGeometry();
    void deleteTempWorkbook() const;
    void writeSettingsBeforeTheEnd();

    MainWindow& m_mainWindow;
    Dialogs& m_dialogs;
    SettingsWriter m_writeSettings;
    QCursor m_handPointer;

    std::filesystem::path m_tempWorkbookPath;
    PreviewGeometry m_geometry;
    QImage m_zoomOri; // Zoom_Ori: the picture as handed over, which every zoom step draws from

    QWidget* m_picture2 = nullptr;
    PictureBox* m_picture1 = nullptr;
    QScrollBar* m_vScroll1 = nullptr;
    QScrollBar* m_hScroll1 = nullptr;
    QGroupBox* m_frame1 = nullptr;
    QPushButton* m_pushButton1 = nullptr;
    QPushButton* m_pushButton2 = nullptr;
    QPushButton* m_pushButton8 = nullptr;
    QPushButton* m_pushButton6 = nullptr;
};

} // namespace penmoor
