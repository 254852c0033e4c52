#pragma once

#include "spreadsheet/picture/textmetrics.h"

#include <memory>
#include <string>
#include <unordered_map>

#include <QFont>
#include <QFontMetrics>

namespace penmoor::picture {

// Text metrics of the fonts the painter draws with, so that layout and painting agree to the
// pixel. Fonts are looked up once per distinct FontSpec.
class QtTextMetrics : public TextMetrics {
public:
    int width(const FontSpec& font, std::string_view text) const override;
    int ascent(const FontSpec& font) const override;
    int descent(const FontSpec& font) const override;

    const QFont& font(const FontSpec& spec) const;

private:
    struct Entry {
        QFont font;
        QFontMetrics metrics;
    };
    const Entry& entry(const FontSpec& spec) const;

    mutable std::unordered_map<std::string, std::unique_ptr<Entry>> m_entries;
};

} // namespace penmoor::picture
