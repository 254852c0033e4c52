#pragma once

#include "spreadsheet/picture/sheetregion.h"

#include <string_view>

namespace penmoor::picture {

// How wide and tall text is in pixels, so that the layout can fit, align, wrap and spill text
// without knowing how it is drawn. The painter answers with the metrics of the real fonts.
class TextMetrics {
public:
    virtual ~TextMetrics() = default;

    virtual int width(const FontSpec& font, std::string_view text) const = 0;
    virtual int ascent(const FontSpec& font) const = 0;
    virtual int descent(const FontSpec& font) const = 0;
};

} // namespace penmoor::picture
