#pragma once

#include <algorithm>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <span>
#include <utility>
#include <vector>

namespace penmoor::xls {

// A growing little-endian byte buffer. The file formats are written field by field through
// it, never by casting structs, so the bytes are the same on every host. Capacity grows
// geometrically and unused capacity is never initialised, which keeps appending cheap.
class ByteBuffer {
public:
    ByteBuffer() = default;
    explicit ByteBuffer(std::size_t capacity) { reserve(capacity); }

    std::size_t size() const { return m_size; }
    const std::uint8_t* data() const { return m_bytes.data(); }
    std::span<const std::uint8_t> bytes() const { return { m_bytes.data(), m_size }; }

    void reserve(std::size_t capacity)
    {
        if (capacity > m_bytes.size())
            m_bytes.resize(capacity);
    }

    void u8(std::uint8_t value) { *grow(1) = value; }
    void u16(std::uint16_t value) { store(grow(2), value); }
    void u32(std::uint32_t value) { store(grow(4), value); }
    void f64(double value) { store(grow(8), std::bit_cast<std::uint64_t>(value)); }
    void append(std::span<const std::uint8_t> bytes)
    {
        if (!bytes.empty())
            std::memcpy(grow(bytes.size()), bytes.data(), bytes.size());
    }
    void zeros(std::size_t count)
    {
        if (count > 0)
            std::memset(grow(count), 0, count);
    }

    // Drops the bytes from `size` on, keeping the capacity.
    void truncate(std::size_t size) { m_size = std::min(size, m_size); }

    // Overwrites bytes already written (record lengths and offsets known only later).
    void patchU16(std::size_t offset, std::uint16_t value) { store(m_bytes.data() + offset, value); }
    void patchU32(std::size_t offset, std::uint32_t value) { store(m_bytes.data() + offset, value); }

    // Hands the bytes over, trimmed to their size.
    std::vector<std::uint8_t> take()
    {
        m_bytes.resize(m_size);
        m_size = 0;
        return std::move(m_bytes);
    }

private:
    std::uint8_t* grow(std::size_t count)
    {
        if (m_size + count > m_bytes.size())
            m_bytes.resize(std::max<std::size_t>(m_size + count, m_bytes.size() * 2 + 256));
        std::uint8_t* at = m_bytes.data() + m_size;
        m_size += count;
        return at;
    }

    template <typename T> static void store(std::uint8_t* at, T value)
    {
        for (std::size_t i = 0; i < sizeof(T); ++i)
            at[i] = static_cast<std::uint8_t>(value >> (8 * i));
    }

    std::vector<std::uint8_t> m_bytes;
    std::size_t m_size = 0;
};

} // namespace penmoor::xls
