#include "tests/xls/support/cfbtestfiles.h"

namespace penmoor::xls::test {

namespace {

std::uint32_t u32(const std::vector<std::uint8_t>& bytes, std::size_t at)
{
    return bytes.at(at) | (bytes.at(at + 1) << 8) | (bytes.at(at + 2) << 16)
        | (std::uint32_t { bytes.at(at + 3) } << 24);
}

std::size_t sectorOffset(std::uint32_t sector)
{
    return 512 + std::size_t { sector } * 512;
}

} // namespace

std::vector<std::uint8_t> patternBytes(std::size_t size, int seed)
{
    std::vector<std::uint8_t> bytes(size);
    std::uint32_t state = 0x9E3779B9u * static_cast<std::uint32_t>(seed + 1);
    for (std::size_t i = 0; i < size; ++i) {
        state = state * 1664525u + 1013904223u;
        bytes[i] = static_cast<std::uint8_t>(state >> 24);
    }
    return bytes;
}

std::vector<DirectoryEntry> directoryEntries(const std::vector<std::uint8_t>& file)
{
    auto fatEntry = [&](std::uint32_t sector) {
        const std::uint32_t fatSector = u32(file, 0x4C + 4 * (sector / 128));
        return u32(file, sectorOffset(fatSector) + 4 * (sector % 128));
    };
    std::vector<DirectoryEntry> entries;
    for (std::uint32_t sector = u32(file, 0x30); sector != 0xFFFFFFFEu; sector = fatEntry(sector)) {
        for (std::size_t k = 0; k < 4; ++k) {
            const std::size_t at = sectorOffset(sector) + 128 * k;
            DirectoryEntry entry;
            const std::size_t nameUnits = (file.at(at + 0x40) | (file.at(at + 0x41) << 8)) / 2;
            for (std::size_t c = 0; c + 1 < nameUnits; ++c)
                entry.name += static_cast<char16_t>(file.at(at + 2 * c) | (file.at(at + 2 * c + 1) << 8));
            entry.type = file.at(at + 0x42);
            entry.colour = file.at(at + 0x43);
            entry.left = u32(file, at + 0x44);
            entry.right = u32(file, at + 0x48);
            entry.child = u32(file, at + 0x4C);
            entry.start = u32(file, at + 0x74);
            entry.size = u32(file, at + 0x78);
            entries.push_back(entry);
        }
    }
    return entries;
}

std::size_t directoryEntryOffset(const std::vector<std::uint8_t>& file, std::uint32_t id)
{
    return sectorOffset(u32(file, 0x30)) + 128 * std::size_t { id };
}

void putU32(std::vector<std::uint8_t>& file, std::size_t offset, std::uint32_t value)
{
    for (std::size_t i = 0; i < 4; ++i)
        file.at(offset + i) = static_cast<std::uint8_t>(value >> (8 * i));
}

void putU16(std::vector<std::uint8_t>& file, std::size_t offset, std::uint16_t value)
{
    file.at(offset) = static_cast<std::uint8_t>(value);
    file.at(offset + 1) = static_cast<std::uint8_t>(value >> 8);
}

} // namespace penmoor::xls::test
