#include "spreadsheet/xls/biffstrings.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/formaterror.h"

#include <algorithm>

namespace penmoor::xls {

bool fitsInOneByte(std::u16string_view text)
{
    return std::all_of(text.begin(), text.end(), [](char16_t unit) { return unit < 0x100; });
}

void writeCharacters(ByteBuffer& out, std::u16string_view text, bool wide)
{
    for (char16_t unit : text) {
        if (wide)
            out.u16(unit);
        else
            out.u8(static_cast<std::uint8_t>(unit));
    }
}

void writeShortString(ByteBuffer& out, std::u16string_view text)
{
    if (text.size() > 255)
        throw WriteError("a text of " + std::to_string(text.size()) + " characters is longer than 255 characters");
    const bool wide = !fitsInOneByte(text);
    out.u8(static_cast<std::uint8_t>(text.size()));
    out.u8(wide ? biff::kStringHighByte : 0);
    writeCharacters(out, text, wide);
}

void writeString(ByteBuffer& out, std::u16string_view text)
{
    if (text.size() > 0xFFFF)
        throw WriteError("a text of " + std::to_string(text.size()) + " characters is too long");
    const bool wide = !fitsInOneByte(text);
    out.u16(static_cast<std::uint16_t>(text.size()));
    out.u8(wide ? biff::kStringHighByte : 0);
    writeCharacters(out, text, wide);
}

std::size_t characterBytes(std::u16string_view text)
{
    return fitsInOneByte(text) ? text.size() : 2 * text.size();
}

std::u16string readCharacters(ByteReader& in, std::size_t count, bool wide)
{
    const auto bytes = in.bytes(wide ? 2 * count : count);
    std::u16string text(count, u'\0');
    for (std::size_t i = 0; i < count; ++i)
        text[i] = wide ? static_cast<char16_t>(loadU16(bytes.data() + 2 * i)) : bytes[i];
    return text;
}

namespace {

// Rich-text runs and extended data may follow the flags; their contents are not used.
std::u16string readFlaggedCharacters(ByteReader& in, std::size_t count)
{
    const std::uint8_t flags = in.u8();
    const std::size_t runs = (flags & biff::kStringRichText) ? in.u16() : 0;
    const std::size_t extension = (flags & biff::kStringExtended) ? in.u32() : 0;
    std::u16string text = readCharacters(in, count, (flags & biff::kStringHighByte) != 0);
    in.skip(4 * runs);
    in.skip(extension);
    return text;
}

} // namespace

std::u16string readShortString(ByteReader& in)
{
    const std::size_t count = in.u8();
    return readFlaggedCharacters(in, count);
}

std::u16string readString(ByteReader& in)
{
    const std::size_t count = in.u16();
    return readFlaggedCharacters(in, count);
}

} // namespace penmoor::xls
