#pragma once

#include "spreadsheet/xls/bytebuffer.h"
#include "spreadsheet/xls/bytereader.h"

#include <string_view>

namespace penmoor::xls {

// BIFF8 text is UTF-16, stored one byte per character when every character is below U+0100.
bool fitsInOneByte(std::u16string_view text);
// The characters alone, in the given width.
void writeCharacters(ByteBuffer& out, std::u16string_view text, bool wide);
// ShortXLUnicodeString: 1-byte length (at most 255), flags, characters.
void writeShortString(ByteBuffer& out, std::u16string_view text);
// XLUnicodeString: 2-byte length, flags, characters.
void writeString(ByteBuffer& out, std::u16string_view text);
// Bytes the characters take, without the length and flags.
std::size_t characterBytes(std::u16string_view text);

// Readers of the same forms inside one record; a length beyond the record raises FormatError.
std::u16string readCharacters(ByteReader& in, std::size_t count, bool wide);
std::u16string readShortString(ByteReader& in);
std::u16string readString(ByteReader& in);

} // namespace penmoor::xls
