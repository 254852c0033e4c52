#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace penmoor::xls::test {

// Deterministic bytes that differ from sector to sector, so a misplaced sector shows.
std::vector<std::uint8_t> patternBytes(std::size_t size, int seed);

// A directory entry as the file holds it, parsed independently of the reader under test.
struct DirectoryEntry {
    std::u16string name;
    std::uint8_t type = 0;
    std::uint8_t colour = 0;
    std::uint32_t left = 0;
    std::uint32_t right = 0;
    std::uint32_t child = 0;
    std::uint32_t start = 0;
    std::uint32_t size = 0;
};

// All directory entries of a well-formed file, following its FAT from the header's slots.
std::vector<DirectoryEntry> directoryEntries(const std::vector<std::uint8_t>& file);

// Byte offset of directory entry `id` in a file whose directory starts in its first directory
// sector (true of every file with at most four entries).
std::size_t directoryEntryOffset(const std::vector<std::uint8_t>& file, std::uint32_t id);

void putU32(std::vector<std::uint8_t>& file, std::size_t offset, std::uint32_t value);
void putU16(std::vector<std::uint8_t>& file, std::size_t offset, std::uint16_t value);

} // namespace penmoor::xls::test
