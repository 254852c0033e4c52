#pragma once

#include "spreadsheet/picture/textmetrics.h"

namespace penmoor::picture {

// Every character 7 pixels wide (a space 3), 10 pixels above the baseline and 3 below: round
// numbers that make the expected positions easy to work out by hand.
class FakeMetrics : public TextMetrics {
public:
    int width(const FontSpec&, std::string_view text) const override
    {
        int total = 0;
        for (char c : text) {
            if ((static_cast<unsigned char>(c) & 0xC0) != 0x80) {
                total += c == ' ' ? 3 : 7;
            }
        }
        return total;
    }
    int ascent(const FontSpec&) const override { return 10; }
    int descent(const FontSpec&) const override { return 3; }
};

} // namespace penmoor::picture
