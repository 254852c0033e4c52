#pragma once

#include "model/settingsstore.h"

#include <chrono>
#include <filesystem>
#include <optional>

#include <QPixmap>
#include <QWidget>

class QCheckBox;

namespace penmoor {

// The start-up splash window: the first picture of the "Splash" folder beside the program
// with the check box "Hide this at next startup" in a 20-pixel strip below it, framed by a
// line along its border.
class Splash : public QWidget {
    Q_OBJECT
public:
    // programFolder holds the "Splash" folder. waitTime is how long SplashShow keeps the
    // window up; without one it is 4 seconds, or 0.4 seconds when IsInIDE.
    Splash(SettingsStore& settings, std::filesystem::path programFolder,
        std::optional<std::chrono::milliseconds> waitTime = std::nullopt, QWidget* parent = nullptr);

    // Shows the window for its time, processing events meanwhile, then hides it for good.
    // Returns at once, showing nothing, when the user switched the splash off, when there is
    // no loadable picture, or on any call after the first. True when the window was shown.
    bool SplashShow();

    // The height of the strip below the picture that holds the check box.
    static constexpr int kStripHeight = 20;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void WaitSeconds();

    SettingsStore& m_settings;
    std::filesystem::path m_programFolder;
    std::chrono::milliseconds m_waitTime;
    QPixmap m_picture;
    QCheckBox* m_check;
    bool m_used = false;
};

} // namespace penmoor
