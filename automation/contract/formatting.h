#pragma once

#include <string>

namespace xl {

// Font of a range. Setting a property sets it on every cell of the range; reading one
// gives the value of the range's top-left cell.
class Font {
public:
    virtual ~Font() = default;

    virtual std::string Name() const = 0;
    virtual void setName(const std::string& name) = 0;
    // "Regular", "Bold", "Italic" or "Bold Italic"
    virtual std::string FontStyle() const = 0;
    virtual void setFontStyle(const std::string& style) = 0;
    // in points
    virtual double Size() const = 0;
    virtual void setSize(double points) = 0;
    // 1 to 56 in the workbook's palette, or kColorIndexAutomatic
    virtual int ColorIndex() const = 0;
    virtual void setColorIndex(int colorIndex) = 0;
};

// Fill of a range.
class Interior {
public:
    virtual ~Interior() = default;

    // 1 to 56 in the workbook's palette, or kColorIndexNone
    virtual int ColorIndex() const = 0;
    virtual void setColorIndex(int colorIndex) = 0;
};

// One edge of a range: Borders(edge) with edge kEdgeLeft .. kInsideHorizontal.
// The outline edges act on the outside of the range, the inside ones on the lines between
// its cells. Clearing an edge (LineStyle kLineStyleNone) also clears the touching edge of
// the neighbouring cell, so that no line stays visible there.
class Border {
public:
    virtual ~Border() = default;

    virtual int Weight() const = 0;
    virtual void setWeight(int weight) = 0;
    virtual int ColorIndex() const = 0;
    virtual void setColorIndex(int colorIndex) = 0;
    virtual int LineStyle() const = 0;
    virtual void setLineStyle(int lineStyle) = 0;
};

} // namespace xl
