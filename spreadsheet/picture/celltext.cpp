#include "spreadsheet/picture/celltext.h"

#include <algorithm>

namespace penmoor::picture {

namespace {

std::size_t characterLength(std::string_view text, std::size_t at)
{
    const auto lead = static_cast<unsigned char>(text[at]);
    const std::size_t length = lead < 0x80 ? 1 : lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : lead >= 0xC0 ? 2 : 1;
    return std::min(length, text.size() - at);
}

int repeatCount(std::string_view unit, int room, const FontSpec& font, const TextMetrics& metrics)
{
    const int unitWidth = unit.empty() ? 0 : metrics.width(font, unit);
    return unitWidth > 0 && room > 0 ? room / unitWidth : 0;
}

std::string repeated(std::string_view unit, int count)
{
    std::string out;
    for (int k = 0; k < count; ++k) {
        out += unit;
    }
    return out;
}

// Appends one paragraph (no line feeds), broken between words, and inside over-long words.
void wrapParagraph(std::string_view paragraph, const FontSpec& font, int boxWidth, const TextMetrics& metrics,
    std::vector<std::string>& lines)
{
    std::string line;
    auto flushWord = [&](std::string_view word) {
        std::string candidate = line.empty() ? std::string(word) : line + " " + std::string(word);
        if (line.empty() || metrics.width(font, candidate) <= boxWidth) {
            line = std::move(candidate);
        } else {
            lines.push_back(std::move(line));
            line = std::string(word);
        }
        // A word wider than the box breaks between characters.
        while (metrics.width(font, line) > boxWidth && characterLength(line, 0) < line.size()) {
            std::size_t cut = characterLength(line, 0);
            while (cut < line.size()) {
                const std::size_t next = cut + characterLength(line, cut);
                if (metrics.width(font, std::string_view(line).substr(0, next)) > boxWidth) {
                    break;
                }
                cut = next;
            }
            if (cut >= line.size()) {
                break;
            }
            lines.push_back(line.substr(0, cut));
            line.erase(0, cut);
        }
    };
    std::size_t start = 0;
    while (start <= paragraph.size()) {
        const std::size_t space = paragraph.find(' ', start);
        const std::size_t end = space == std::string_view::npos ? paragraph.size() : space;
        if (end > start) {
            flushWord(paragraph.substr(start, end - start));
        }
        if (space == std::string_view::npos) {
            break;
        }
        start = space + 1;
    }
    lines.push_back(std::move(line));
}

} // namespace

std::string expandFill(const ShownForm& form, const FontSpec& font, int boxWidth, const TextMetrics& metrics)
{
    if (form.fillOffset == std::string::npos) {
        return form.text;
    }
    const int room = boxWidth - metrics.width(font, form.text);
    std::string text = form.text;
    text.insert(form.fillOffset, repeated(form.fillCharacter, repeatCount(form.fillCharacter, room, font, metrics)));
    return text;
}

std::string fitNumber(const ShownValue& shown, const FontSpec& font, int boxWidth, const TextMetrics& metrics)
{
    for (const ShownForm& form : shown.forms) {
        if (metrics.width(font, form.text) <= boxWidth) {
            return expandFill(form, font, boxWidth, metrics);
        }
    }
    return repeated("#", repeatCount("#", boxWidth, font, metrics));
}

std::vector<std::string> wrapText(std::string_view text, const FontSpec& font, int boxWidth, const TextMetrics& metrics)
{
    std::vector<std::string> lines;
    std::size_t start = 0;
    while (true) {
        const std::size_t feed = text.find('\n', start);
        std::string_view paragraph
            = text.substr(start, feed == std::string_view::npos ? std::string_view::npos : feed - start);
        if (!paragraph.empty() && paragraph.back() == '\r') {
            paragraph.remove_suffix(1);
        }
        wrapParagraph(paragraph, font, boxWidth, metrics, lines);
        if (feed == std::string_view::npos) {
            break;
        }
        start = feed + 1;
    }
    return lines;
}

} // namespace penmoor::picture
