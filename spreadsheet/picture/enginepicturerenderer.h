#pragma once

#include "spreadsheet/builtin/picturerenderer.h"

namespace penmoor::picture {

// The picture that the built-in application's CopyPicture hands out: the block of the sheet
// painted as the spreadsheet application shows it. Needs a QGuiApplication; without one it
// raises xl::Error instead of painting.
class EnginePictureRenderer : public engine::PictureRenderer {
public:
    xl::Picture renderPicture(
        const engine::Workbook& workbook, const engine::Sheet& sheet, const engine::Region& block) override;
};

} // namespace penmoor::picture
