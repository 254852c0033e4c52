#pragma once

namespace penmoor {

// The pointer codes of a window. The hourglass of a build wins over the other two: while it
// shows, the mouse-move handlers leave the pointer alone.
enum class MousePointer {
    Default = 0,
    Hourglass = 11,
    Custom = 99, // the hand over buttons
};

// The main window (Form1) as the build driver and the preview window use it. The window
// implements it together with the model's MainWindowView.
class MainWindow {
public:
    virtual ~MainWindow() = default;

    // Stops the window from redrawing until unlockDrawing (LockWindowUpdate with its handle).
    virtual void lockDrawing() = 0;
    // Lets it redraw again (LockWindowUpdate with a null handle); nothing happens when it is
    // not locked, so releasing twice is harmless.
    virtual void unlockDrawing() = 0;

    virtual void setMousePointer(MousePointer pointer) = 0;

    // Checks the years or weeks of the selected period mode, corrects them in their boxes and
    // tells the user about every correction; true when a problem was reported.
    virtual bool CheckPeriodOptions() = 0;

    // Shows the window, not modal ("< Back" of the preview window).
    virtual void show() = 0;
    // Hides the window once the preview window shows a build.
    virtual void hide() = 0;
};

} // namespace penmoor
