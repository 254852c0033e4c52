#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

namespace penmoor::engine {

// Colour indexes refer to the workbook's palette, 1 to 56. Fonts and edges may instead use the
// automatic colour (the system's window text colour); a fill may be absent.
inline constexpr std::uint8_t kAutomaticColor = 0;
inline constexpr std::uint8_t kNoFill = 0;

enum class HorizontalAlignment : std::uint8_t {
    General, // numbers to the right, text to the left
    Left,
    Center,
    Right,
};

enum class VerticalAlignment : std::uint8_t {
    Top,
    Center,
    Bottom,
};

// The line of one cell edge, by weight; every line is continuous.
enum class LineStyle : std::uint8_t {
    None,
    Hair,
    Thin,
    Medium,
    Thick,
};

enum class EdgeSide : std::uint8_t {
    Left,
    Right,
    Top,
    Bottom,
};

struct Edge {
    LineStyle line = LineStyle::None;
    std::uint8_t colorIndex = kAutomaticColor;

    bool operator==(const Edge&) const = default;
};

struct Font {
    std::string name = "Arial";
    double sizePoints = 10.0;
    bool bold = false;
    bool italic = false;
    std::uint8_t colorIndex = kAutomaticColor;

    bool operator==(const Font&) const = default;
};

// Everything a cell's format holds. A plain value: equal records mean equal formats.
struct CellStyle {
    Font font;
    std::string numberFormat = "General";
    std::uint8_t fillColorIndex = kNoFill; // a solid fill in this palette colour
    std::array<Edge, 4> edges {}; // indexed by EdgeSide
    HorizontalAlignment horizontal = HorizontalAlignment::General;
    VerticalAlignment vertical = VerticalAlignment::Bottom;
    bool wrapText = false;

    Edge& edge(EdgeSide side) { return edges[static_cast<std::size_t>(side)]; }
    const Edge& edge(EdgeSide side) const { return edges[static_cast<std::size_t>(side)]; }

    bool operator==(const CellStyle&) const = default;
};

struct CellStyleHash {
    std::size_t operator()(const CellStyle& style) const;
};

// A small integer naming an interned CellStyle; ids stay valid for the table's lifetime.
using StyleId = std::uint32_t;
inline constexpr StyleId kDefaultStyleId = 0;

// The workbook's shared formats: each distinct CellStyle is stored once and named by its id.
// Id 0 is the default format (Arial 10, General, no fill, no border, general/bottom alignment).
class StyleTable {
public:
    StyleTable();
    StyleTable(const StyleTable&) = delete;
    StyleTable& operator=(const StyleTable&) = delete;
    StyleTable(StyleTable&&) = default; // the map's nodes, and so m_styles, stay where they are
    StyleTable& operator=(StyleTable&&) = default;

    // The id of an equal record, adding it when it is new.
    StyleId intern(const CellStyle& style);
    // The record of an id handed out by intern(); raises std::out_of_range for any other.
    const CellStyle& style(StyleId id) const { return *m_styles.at(id); }
    std::size_t size() const { return m_styles.size(); }

private:
    std::unordered_map<CellStyle, StyleId, CellStyleHash> m_ids;
    std::vector<const CellStyle*> m_styles; // keys of m_ids, which never move
};

} // namespace penmoor::engine
