#pragma once

#include "spreadsheet/xls/formaterror.h"

#include <bit>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>

namespace penmoor::xls {

// Little-endian field reads from a read-only byte span. Every read checks that the field lies
// inside the span and raises FormatError naming what was being read otherwise.
class ByteReader {
public:
    ByteReader(std::span<const std::uint8_t> bytes, const char* what)
        : m_bytes(bytes)
        , m_what(what)
    {
    }

    std::size_t offset() const { return m_offset; }
    std::size_t remaining() const { return m_bytes.size() - m_offset; }
    std::span<const std::uint8_t> rest() const { return m_bytes.subspan(m_offset); }

    std::uint8_t u8() { return static_cast<std::uint8_t>(load(1)); }
    std::uint16_t u16() { return static_cast<std::uint16_t>(load(2)); }
    std::uint32_t u32() { return static_cast<std::uint32_t>(load(4)); }
    double f64() { return std::bit_cast<double>(load(8)); }
    std::span<const std::uint8_t> bytes(std::size_t count)
    {
        need(count);
        auto part = m_bytes.subspan(m_offset, count);
        m_offset += count;
        return part;
    }
    void skip(std::size_t count) { bytes(count); }

private:
    void need(std::size_t count) const
    {
        if (count > remaining())
            throw FormatError(std::string(m_what) + " is cut short");
    }
    std::uint64_t load(std::size_t count)
    {
        need(count);
        std::uint64_t value = 0;
        for (std::size_t i = 0; i < count; ++i)
            value |= std::uint64_t { m_bytes[m_offset + i] } << (8 * i);
        m_offset += count;
        return value;
    }

    std::span<const std::uint8_t> m_bytes;
    const char* m_what;
    std::size_t m_offset = 0;
};

// Unchecked little-endian loads for callers that have already checked the bounds.
inline std::uint16_t loadU16(const std::uint8_t* at)
{
    return static_cast<std::uint16_t>(at[0] | (at[1] << 8));
}
inline std::uint32_t loadU32(const std::uint8_t* at)
{
    return std::uint32_t { at[0] } | (std::uint32_t { at[1] } << 8) | (std::uint32_t { at[2] } << 16)
        | (std::uint32_t { at[3] } << 24);
}

} // namespace penmoor::xls
