#include "spreadsheet/picture/enginepicturerenderer.h"

#include "spreadsheet/picture/sheetpainter.h"
#include "spreadsheet/picture/workbookregion.h"

namespace penmoor::picture {

xl::Picture EnginePictureRenderer::renderPicture(
    const engine::Workbook& workbook, const engine::Sheet& sheet, const engine::Region& block)
{
    return paintSheetRegion(sheetRegion(workbook, sheet, block));
}

} // namespace penmoor::picture
