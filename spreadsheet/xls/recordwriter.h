#pragma once

#include "spreadsheet/xls/bytebuffer.h"

#include <cstdint>
#include <span>

namespace penmoor::xls {

// Appends BIFF records to a stream: begin() writes the header with a placeholder length, the
// caller appends the body to out(), end() fills the length in. Offsets are absolute positions
// in the stream, as BOUNDSHEET, INDEX and EXTSST need them.
class RecordWriter {
public:
    explicit RecordWriter(ByteBuffer& out)
        : m_out(out)
    {
    }

    ByteBuffer& out() { return m_out; }
    std::size_t offset() const { return m_out.size(); }
    // Bytes of body written since begin().
    std::size_t bodySize() const { return m_out.size() - m_bodyStart; }

    void begin(std::uint16_t type);
    // Raises WriteError when the body outgrew the record limit: a fault of the writer itself.
    void end();
    // A record whose body is exactly these bytes.
    void record(std::uint16_t type, std::span<const std::uint8_t> body);
    void emptyRecord(std::uint16_t type);
    void u16Record(std::uint16_t type, std::uint16_t value);

private:
    ByteBuffer& m_out;
    std::size_t m_bodyStart = 0;
};

} // namespace penmoor::xls
