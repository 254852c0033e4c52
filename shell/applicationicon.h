#pragma once

class QIcon;

namespace penmoor {

// The program's icon in every size it ships.
QIcon applicationIcon();

} // namespace penmoor
