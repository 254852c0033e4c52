#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace penmoor::xls {

struct Record {
    std::uint16_t type = 0;
    std::size_t offset = 0; // of the record header in the stream
    std::span<const std::uint8_t> body;
};

// Walks the records of a BIFF stream from a given offset. Each step checks that the header and
// the body lie inside the stream; a record cut off by the end of the stream raises FormatError.
class RecordReader {
public:
    RecordReader(std::span<const std::uint8_t> stream, std::size_t offset);

    bool atEnd() const;
    Record next();
    // The type of the next record, or 0 at the end.
    std::uint16_t peekType() const;
    std::size_t offset() const { return m_offset; }

private:
    std::span<const std::uint8_t> m_stream;
    std::size_t m_offset;
};

// A record with the CONTINUE records that follow it, read as one run of bytes whose fragment
// boundaries stay known (strings in the shared string table restate their width at each one).
class ContinuedReader {
public:
    // Takes `first` and collects the CONTINUE records after it from `records`.
    ContinuedReader(const Record& first, RecordReader& records);

    std::size_t remaining() const { return m_remaining; }
    std::uint8_t u8();
    std::uint16_t u16();
    std::uint32_t u32();
    void skip(std::size_t count);
    // Characters of a string whose flags byte has been read; at each fragment boundary the
    // next fragment starts with a new flags byte that gives the width of the rest.
    std::u16string characters(std::size_t count, bool wide);

private:
    void nextFragment();
    void need(std::size_t count) const;

    std::vector<std::span<const std::uint8_t>> m_fragments;
    std::size_t m_fragment = 0;
    std::size_t m_offset = 0;
    std::size_t m_remaining = 0;
};

} // namespace penmoor::xls
