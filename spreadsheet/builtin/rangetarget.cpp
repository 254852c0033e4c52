#include "spreadsheet/builtin/rangetarget.h"

namespace penmoor::engine {

RangeTarget::RangeTarget(SheetHandle sheet, const Region& region)
    : m_sheet(std::move(sheet))
    , m_region(region)
{
}

void RangeTarget::format(const std::function<void(CellStyle&)>& change) const
{
    applyFormat(m_sheet.workbook().styles(), m_sheet.sheet(), m_region, change);
}

void RangeTarget::formatBorder(
    BorderIndex border, bool touchingNeighbours, const std::function<void(Edge&)>& change) const
{
    Sheet& sheet = m_sheet.sheet();
    StyleTable& styles = m_sheet.workbook().styles();
    for (const EdgeTarget& target : borderTargets(m_region, border, touchingNeighbours))
        applyFormat(styles, sheet, target.cells, [&](CellStyle& style) { change(style.edge(target.side)); });
}

const CellStyle& RangeTarget::topLeftStyle() const
{
    const Sheet& sheet = m_sheet.sheet();
    return m_sheet.workbook().styles().style(sheet.effectiveStyle(m_region.topLeft()));
}

Edge RangeTarget::visibleBorder(BorderIndex border) const
{
    return penmoor::engine::visibleBorder(m_sheet.workbook().styles(), m_sheet.sheet(), m_region, border);
}

} // namespace penmoor::engine
