#pragma once

#include <filesystem>

class QWidget;

namespace penmoor {

// The optional skin is a Qt style sheet in the file "x/o.cjs" of the program's folder.
// Gives the main window the standard colours and the skin's style sheet, when the skin file
// exists and can be read; otherwise leaves the window exactly as it is. True when applied.
bool ApplySkin(QWidget& mainWindow, const std::filesystem::path& programFolder);

} // namespace penmoor
