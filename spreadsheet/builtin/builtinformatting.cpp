#include "spreadsheet/builtin/builtinformatting.h"

#include "automation/contract/constants.h"
#include "automation/contract/error.h"
#include "spreadsheet/builtin/contractvalues.h"
#include "spreadsheet/workbook/text.h"

#include <cmath>

namespace penmoor::engine {

namespace {

constexpr std::size_t kMaxFontNameLength = 31;
constexpr double kMinFontSize = 1.0;
constexpr double kMaxFontSize = 409.0;

} // namespace

BuiltinFont::BuiltinFont(RangeTarget target)
    : m_target(std::move(target))
{
}

std::string BuiltinFont::Name() const
{
    return m_target.topLeftStyle().font.name;
}

void BuiltinFont::setName(const std::string& name)
{
    if (name.empty() || characterCount(name) > kMaxFontNameLength)
        throw xl::Error("The font name \"" + name + "\" is not valid: it must have 1 to 31 characters.");
    m_target.format([&](CellStyle& style) { style.font.name = name; });
}

std::string BuiltinFont::FontStyle() const
{
    return fontStyleName(m_target.topLeftStyle().font);
}

void BuiltinFont::setFontStyle(const std::string& style)
{
    engine::Font checked;
    applyFontStyle(style, checked); // rejects an unknown style before anything changes
    m_target.format([&](CellStyle& cellStyle) {
        cellStyle.font.bold = checked.bold;
        cellStyle.font.italic = checked.italic;
    });
}

double BuiltinFont::Size() const
{
    return m_target.topLeftStyle().font.sizePoints;
}

void BuiltinFont::setSize(double points)
{
    if (!std::isfinite(points) || points < kMinFontSize || points > kMaxFontSize)
        throw xl::Error("The font size " + std::to_string(points) + " is not valid: it must be 1 to 409 points.");
    m_target.format([&](CellStyle& style) { style.font.sizePoints = points; });
}

int BuiltinFont::ColorIndex() const
{
    return fontColorToContract(m_target.topLeftStyle().font.colorIndex);
}

void BuiltinFont::setColorIndex(int colorIndex)
{
    const std::uint8_t color = fontColorFrom(colorIndex);
    m_target.format([&](CellStyle& style) { style.font.colorIndex = color; });
}

BuiltinInterior::BuiltinInterior(RangeTarget target)
    : m_target(std::move(target))
{
}

int BuiltinInterior::ColorIndex() const
{
    return fillColorToContract(m_target.topLeftStyle().fillColorIndex);
}

void BuiltinInterior::setColorIndex(int colorIndex)
{
    const std::uint8_t color = fillColorFrom(colorIndex);
    m_target.format([&](CellStyle& style) { style.fillColorIndex = color; });
}

BuiltinBorder::BuiltinBorder(RangeTarget target, BorderIndex border)
    : m_target(std::move(target))
    , m_border(border)
{
}

int BuiltinBorder::Weight() const
{
    return weightToContract(m_target.visibleBorder(m_border).line);
}

void BuiltinBorder::setWeight(int weight)
{
    const engine::LineStyle line = lineWeightFrom(weight);
    m_target.formatBorder(m_border, false, [&](Edge& edge) { edge.line = line; });
}

int BuiltinBorder::ColorIndex() const
{
    const Edge edge = m_target.visibleBorder(m_border);
    return edge.line == engine::LineStyle::None ? xl::kColorIndexNone : fontColorToContract(edge.colorIndex);
}

void BuiltinBorder::setColorIndex(int colorIndex)
{
    if (colorIndex == xl::kColorIndexNone) {
        clear();
        return;
    }
    const std::uint8_t color = borderColorFrom(colorIndex);
    m_target.formatBorder(m_border, false, [&](Edge& edge) {
        edge.colorIndex = color;
        if (edge.line == engine::LineStyle::None)
            edge.line = engine::LineStyle::Thin;
    });
}

int BuiltinBorder::LineStyle() const
{
    return m_target.visibleBorder(m_border).line == engine::LineStyle::None ? xl::kLineStyleNone
                                                                            : xl::kLineStyleContinuous;
}

void BuiltinBorder::setLineStyle(int lineStyle)
{
    if (lineStyle == xl::kLineStyleNone) {
        clear();
    } else if (lineStyle == xl::kLineStyleContinuous) {
        m_target.formatBorder(m_border, false, [](Edge& edge) {
            if (edge.line == engine::LineStyle::None)
                edge.line = engine::LineStyle::Thin;
        });
    } else {
        throw xl::Error("The border line style " + std::to_string(lineStyle)
            + " is not supported (only continuous lines and none).");
    }
}

void BuiltinBorder::clear() const
{
    m_target.formatBorder(m_border, true, [](Edge& edge) { edge = Edge {}; });
}

} // namespace penmoor::engine
