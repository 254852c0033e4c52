#include "spreadsheet/picture/qttextmetrics.h"

#include "spreadsheet/picture/fontlibrary.h"

#include <charconv>

#include <QString>

namespace penmoor::picture {

namespace {

// One key per distinct font: name, size and the four style switches.
std::string keyOf(const FontSpec& spec)
{
    std::string key = spec.name;
    key += '\n';
    char buffer[32];
    const auto [end, ec] = std::to_chars(buffer, buffer + sizeof buffer, spec.sizePoints);
    key.append(buffer, ec == std::errc() ? end : buffer);
    key += spec.bold ? 'b' : '-';
    key += spec.italic ? 'i' : '-';
    key += spec.underline ? 'u' : '-';
    key += spec.strikeout ? 's' : '-';
    return key;
}

} // namespace

const QtTextMetrics::Entry& QtTextMetrics::entry(const FontSpec& spec) const
{
    std::unique_ptr<Entry>& slot = m_entries[keyOf(spec)];
    if (!slot) {
        QFont font = pictureFont(spec);
        slot = std::make_unique<Entry>(Entry { font, QFontMetrics(font) });
    }
    return *slot;
}

const QFont& QtTextMetrics::font(const FontSpec& spec) const
{
    return entry(spec).font;
}

int QtTextMetrics::width(const FontSpec& font, std::string_view text) const
{
    return entry(font).metrics.horizontalAdvance(QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size())));
}

int QtTextMetrics::ascent(const FontSpec& font) const
{
    return entry(font).metrics.ascent();
}

int QtTextMetrics::descent(const FontSpec& font) const
{
    return entry(font).metrics.descent();
}

} // namespace penmoor::picture
