#pragma once

#include "automation/contract/picture.h"
#include "spreadsheet/workbook/workbook.h"

namespace penmoor::engine {

// Draws a block of a sheet as the application shows it, for CopyPicture. The sheet picture
// implements it; the built-in application takes one when it is created. Formula results are
// current when it is called.
class PictureRenderer {
public:
    virtual ~PictureRenderer() = default;

    // Raises xl::Error when the picture cannot be made.
    virtual xl::Picture renderPicture(const Workbook& workbook, const Sheet& sheet, const Region& block) = 0;
};

} // namespace penmoor::engine
