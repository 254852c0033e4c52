#include "spreadsheet/xls/recordreader.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/formaterror.h"

namespace penmoor::xls {

RecordReader::RecordReader(std::span<const std::uint8_t> stream, std::size_t offset)
    : m_stream(stream)
    , m_offset(offset)
{
    if (offset > stream.size())
        throw FormatError("a record offset lies beyond the end of the workbook stream");
}

bool RecordReader::atEnd() const
{
    return m_offset >= m_stream.size();
}

std::uint16_t RecordReader::peekType() const
{
    if (m_stream.size() - m_offset < biff::kRecordHeaderSize)
        return 0;
    return loadU16(m_stream.data() + m_offset);
}

Record RecordReader::next()
{
    if (m_stream.size() - m_offset < biff::kRecordHeaderSize)
        throw FormatError("the workbook stream ends inside a record header at offset " + std::to_string(m_offset));
    Record record;
    record.type = loadU16(m_stream.data() + m_offset);
    const std::size_t length = loadU16(m_stream.data() + m_offset + 2);
    record.offset = m_offset;
    const std::size_t bodyStart = m_offset + biff::kRecordHeaderSize;
    if (length > m_stream.size() - bodyStart)
        throw FormatError("the record at offset " + std::to_string(m_offset) + " runs past the end of the stream");
    record.body = m_stream.subspan(bodyStart, length);
    m_offset = bodyStart + length;
    return record;
}

ContinuedReader::ContinuedReader(const Record& first, RecordReader& records)
{
    m_fragments.push_back(first.body);
    m_remaining = first.body.size();
    while (records.peekType() == biff::kContinue) {
        const Record more = records.next();
        m_fragments.push_back(more.body);
        m_remaining += more.body.size();
    }
}

void ContinuedReader::need(std::size_t count) const
{
    if (count > m_remaining)
        throw FormatError("a record and its continuations are shorter than their contents claim");
}

void ContinuedReader::nextFragment()
{
    while (m_fragment < m_fragments.size() && m_offset == m_fragments[m_fragment].size()) {
        ++m_fragment;
        m_offset = 0;
    }
}

std::uint8_t ContinuedReader::u8()
{
    need(1);
    nextFragment();
    --m_remaining;
    return m_fragments[m_fragment][m_offset++];
}

std::uint16_t ContinuedReader::u16()
{
    const std::uint16_t low = u8();
    return static_cast<std::uint16_t>(low | (u8() << 8));
}

std::uint32_t ContinuedReader::u32()
{
    const std::uint32_t low = u16();
    return low | (std::uint32_t { u16() } << 16);
}

void ContinuedReader::skip(std::size_t count)
{
    need(count);
    while (count > 0) {
        nextFragment();
        const std::size_t step = std::min(count, m_fragments[m_fragment].size() - m_offset);
        m_offset += step;
        m_remaining -= step;
        count -= step;
    }
}

std::u16string ContinuedReader::characters(std::size_t count, bool wide)
{
    // Each character takes at least one byte, so a lying count fails here before any allocation.
    need(count);
    std::u16string text;
    text.reserve(count);
    while (text.size() < count) {
        if (m_offset == m_fragments[m_fragment].size()) {
            nextFragment();
            wide = (u8() & biff::kStringHighByte) != 0;
            continue;
        }
        if (wide) {
            need(2);
            if (m_fragments[m_fragment].size() - m_offset < 2)
                throw FormatError("a string splits a character across two records");
            text += static_cast<char16_t>(u16());
        } else {
            text += static_cast<char16_t>(u8());
        }
    }
    return text;
}

} // namespace penmoor::xls
