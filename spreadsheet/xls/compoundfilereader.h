#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace penmoor::xls {

// A strict reader of version 3 compound files over a read-only byte span (which must outlive
// it). The constructor validates the header, the sector tables, the directory and the chains of
// every stream in the root storage, and raises FormatError with the reason on the first fault:
// no loop, no sector outside the file and no size beyond the data gets past it, and nothing is
// allocated beyond what the file itself holds.
class CompoundFileReader {
public:
    struct Entry {
        std::u16string name;
        bool isStream = false;
        std::uint64_t size = 0;
    };

    explicit CompoundFileReader(std::span<const std::uint8_t> file);

    // The entries of the root storage, streams and storages, in directory tree order.
    const std::vector<Entry>& entries() const { return m_entries; }
    // The bytes of the root-level stream of this name (letter case ignored), or nothing.
    std::optional<std::vector<std::uint8_t>> readStream(std::u16string_view name) const;

private:
    struct StreamChain {
        bool inMiniStream = false;
        std::vector<std::uint32_t> sectors;
    };

    std::span<const std::uint8_t> m_file;
    std::vector<Entry> m_entries;
    std::vector<StreamChain> m_chains; // one per entry
    std::vector<std::uint32_t> m_miniStreamSectors;
};

} // namespace penmoor::xls
