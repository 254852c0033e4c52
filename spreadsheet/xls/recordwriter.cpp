#include "spreadsheet/xls/recordwriter.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/formaterror.h"

#include <string>

namespace penmoor::xls {

void RecordWriter::begin(std::uint16_t type)
{
    m_out.u16(type);
    m_out.u16(0);
    m_bodyStart = m_out.size();
}

void RecordWriter::end()
{
    const std::size_t length = bodySize();
    if (length > biff::kMaxRecordBody)
        throw WriteError("a record of " + std::to_string(length) + " bytes is longer than the format allows");
    m_out.patchU16(m_bodyStart - 2, static_cast<std::uint16_t>(length));
}

void RecordWriter::record(std::uint16_t type, std::span<const std::uint8_t> body)
{
    begin(type);
    m_out.append(body);
    end();
}

void RecordWriter::emptyRecord(std::uint16_t type)
{
    begin(type);
    end();
}

void RecordWriter::u16Record(std::uint16_t type, std::uint16_t value)
{
    begin(type);
    m_out.u16(value);
    end();
}

} // namespace penmoor::xls
