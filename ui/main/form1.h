#pragma once

#include "automation/contract/application.h"
#include "automation/mainwindow.h"
#include "model/currentyear.h"
#include "model/mainwindowview.h"
#include "model/options.h"
#include "model/settingsstore.h"
#include "shell/dialogs.h"
#include "shell/makerpage.h"
#include "shell/unitrandom.h"
#include "ui/main/itemeditor.h"

#include <array>
#include <chrono>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>

#include <QCursor>
#include <QPointer>
#include <QWidget>

class QGroupBox;
class QLabel;
class QLineEdit;
class QPushButton;
class QRadioButton;

namespace penmoor {

class ItemList;
class Splash;

// What the main window works with; the program wires it once. Everything referred to must
// outlive the window.
struct Form1Setup {
    SettingsStore& settings;
    Dialogs& dialogs;
    // Asked once at start-up whether a spreadsheet application can be created.
    xl::ApplicationFactory& spreadsheets;
    // Where the optional program files are: the "Splash" folder, the pointer and skin files.
    std::filesystem::path programFolder;
    YearSource currentYear = currentCalendarYear;
    // The draw that decides whether this start opens the maker's page, and how it opens.
    UnitRandom random;
    AddressOpener openAddress;
    // How long the splash window stays; none: 4 seconds, or 0.4 in development.
    std::optional<std::chrono::milliseconds> splashTime;
};

// The main window: the company name, the item list with its editor, the period options, and
// the commands that clear or fill the options and start a build. It is the view through which
// the model and the sheet builder read and write its boxes, and the window that the build
// driver locks, hides and shows. Its handlers stay thin: the model and the checks decide, the
// window turns their decisions into widget updates.
class Form1 : public QWidget, public MainWindowView, public MainWindow {
    Q_OBJECT
public:
    explicit Form1(Form1Setup setup, QWidget* parent = nullptr);
    ~Form1() override;

    // The load step that starts the program: centring, skin, caption and icon, the pointer,
    // the maker's page, the splash window, the window's own settings and the stored options
    // and list (with the drawing locked), then the check for a spreadsheet application.
    // Returns when the window is ready to be shown.
    void load();

    // What "Start Creating Template" runs (the build driver's start command).
    void setStartCommand(std::function<void()> command);

    Options& options() { return m_options; }

    // The close sequence: the item list and the options go to the settings store. A store
    // that cannot keep them is told to the user; nothing holds the window open.
    void writeSettings();

    bool ValidateYear(TextBox box);
    bool ValidateWeeks(TextBox box);

    // MainWindowView
    void replaceListEntries(std::vector<std::string> names) override;
    int listEntryCount() const override;
    void setSelectedListIndex(int index) override;
    int selectedListIndex() const override;
    std::string text(TextBox box) const override;
    void setText(TextBox box, std::string_view text) override;
    bool isOptionOn(OptionButton button) const override;
    void setOptionOn(OptionButton button, bool on) override;

    // MainWindow
    void lockDrawing() override;
    void unlockDrawing() override;
    void setMousePointer(MousePointer pointer) override;
    bool CheckPeriodOptions() override;
    void show() override;
    void hide() override;

    MousePointer mousePointer() const { return m_pointer; }
    // The pointer that the window's buttons show.
    const QCursor& customPointer() const { return m_customPointer; }

signals:
    // The window was closed and its settings written: the program ends.
    void unloaded();

protected:
    void closeEvent(QCloseEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void createControls();
    void layOutControls();
    void connectControls();

    QLineEdit* box(TextBox box) const;
    QRadioButton* option(OptionButton button) const;
    // The box that a leaving focus checks, if the box is one of those.
    std::optional<TextBox> checkedOnLeaving(const QObject* widget) const;

    // A box that the focus left is checked once the focus has settled, outside the focus
    // change itself; a command clicked meanwhile runs that check first and is dropped when the
    // check reported a problem, so no command runs on a value that is about to be corrected.
    // True when the check reported a problem; the focus is then back in the box.
    bool runPendingCheck();

    // The command buttons; each first settles a pending check.
    void runCommand(const std::function<void()>& command);
    void putPointersAside();
    void restorePointers();

    SettingsStore& m_settings;
    Dialogs& m_dialogs;
    xl::ApplicationFactory& m_spreadsheets;
    std::filesystem::path m_programFolder;
    YearSource m_currentYear;
    UnitRandom m_random;
    AddressOpener m_openAddress;
    std::optional<std::chrono::milliseconds> m_splashTime;

    Options m_options;
    ItemEditor m_editor;
    std::function<void()> m_startCommand;
    std::unique_ptr<Splash> m_splash;

    QGroupBox* m_frame6 = nullptr;
    QGroupBox* m_frame4 = nullptr;
    QGroupBox* m_frame1 = nullptr;
    ItemList* m_list1 = nullptr;
    std::array<QLineEdit*, 6> m_boxes {};
    std::array<QRadioButton*, 3> m_optionButtons {};
    QLabel* m_label2 = nullptr;
    QLabel* m_label3 = nullptr;
    std::array<QPushButton*, 3> m_pushButton2 {};
    QPushButton* m_pushButton3 = nullptr;
    QPushButton* m_pushButton5 = nullptr;
    QPushButton* m_pushButton6 = nullptr;
    QPushButton* m_pushButton22 = nullptr;

    std::optional<TextBox> m_pendingCheck;
    bool m_drawingLocked = false;
    MousePointer m_pointer = MousePointer::Default;
    QCursor m_customPointer;
    // The widgets' own pointers, put aside while the hourglass shows over the whole window.
    std::vector<std::pair<QPointer<QWidget>, QCursor>> m_pointersAside;
};

} // namespace penmoor
