#pragma once

class QWidget;

namespace penmoor {

// Places the window in the middle of its screen's available area.
void CenterForm(QWidget& window);

// Gives the window, and its labels, option buttons, check boxes and frames, the system
// colour of button faces as background. Other controls keep their colours.
void SetStandardColors(QWidget& window);

} // namespace penmoor
