#pragma once

#include "automation/contract/formatting.h"
#include "spreadsheet/builtin/rangetarget.h"

namespace penmoor::engine {

class BuiltinFont : public xl::Font {
public:
    explicit BuiltinFont(RangeTarget target);

    std::string Name() const override;
    void setName(const std::string& name) override;
    std::string FontStyle() const override;
    void setFontStyle(const std::string& style) override;
    double Size() const override;
    void setSize(double points) override;
    int ColorIndex() const override;
    void setColorIndex(int colorIndex) override;

private:
    RangeTarget m_target;
};

class BuiltinInterior : public xl::Interior {
public:
    explicit BuiltinInterior(RangeTarget target);

    int ColorIndex() const override;
    void setColorIndex(int colorIndex) override;

private:
    RangeTarget m_target;
};

// One border of a range. Setting a weight or a colour draws a line where there was none (thin
// for a colour); clearing the line (LineStyle none, or colour none) also clears the touching
// edges of the neighbouring cells.
class BuiltinBorder : public xl::Border {
public:
    BuiltinBorder(RangeTarget target, BorderIndex border);

    int Weight() const override;
    void setWeight(int weight) override;
    int ColorIndex() const override;
    void setColorIndex(int colorIndex) override;
    int LineStyle() const override;
    void setLineStyle(int lineStyle) override;

private:
    void clear() const;

    RangeTarget m_target;
    BorderIndex m_border;
};

} // namespace penmoor::engine
