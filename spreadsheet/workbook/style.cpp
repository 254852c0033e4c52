#include "spreadsheet/workbook/style.h"

#include <functional>

namespace penmoor::engine {

namespace {

void combine(std::size_t& seed, std::size_t value)
{
    seed ^= value + 0x9e3779b97f4a7c15ULL + (seed << 6) + (seed >> 2);
}

} // namespace

std::size_t CellStyleHash::operator()(const CellStyle& style) const
{
    std::size_t seed = std::hash<std::string>()(style.font.name);
    combine(seed, std::hash<double>()(style.font.sizePoints));
    combine(seed, (style.font.bold ? 1u : 0u) | (style.font.italic ? 2u : 0u) | (style.wrapText ? 4u : 0u));
    combine(seed, style.font.colorIndex);
    combine(seed, std::hash<std::string>()(style.numberFormat));
    combine(seed, style.fillColorIndex);
    for (const Edge& edge : style.edges)
        combine(seed, static_cast<std::size_t>(edge.line) << 8 | edge.colorIndex);
    combine(seed, static_cast<std::size_t>(style.horizontal) << 4 | static_cast<std::size_t>(style.vertical));
    return seed;
}

StyleTable::StyleTable()
{
    intern(CellStyle {});
}

StyleId StyleTable::intern(const CellStyle& style)
{
    const auto [it, inserted] = m_ids.try_emplace(style, static_cast<StyleId>(m_styles.size()));
    if (inserted)
        m_styles.push_back(&it->first);
    return it->second;
}

} // namespace penmoor::engine
