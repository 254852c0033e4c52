#pragma once

#include "automation/contract/picture.h"

#include <filesystem>

namespace penmoor {

// The preview window (Form2) as a build hands its result over to it, in this order: the
// picture, the path of the temporary workbook, then show. The window is created at its first
// use and stays created; each hand-over gives it a new picture to set up.
class PreviewWindow {
public:
    virtual ~PreviewWindow() = default;

    // The picture of the sheet, for Picture1.
    virtual void setPicture(xl::Picture picture) = 0;
    // TempWorkbookPath: from now on the window owns that file. "Save Results To Excel File"
    // copies it; "< Back" and closing the window delete it.
    virtual void setTempWorkbookPath(const std::filesystem::path& path) = 0;
    // Shows the window, not modal.
    virtual void show() = 0;
};

} // namespace penmoor
