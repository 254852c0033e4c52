#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace penmoor::xls {

// One stream of the root storage: its name (1 to 31 UTF-16 units, unique without regard to
// letter case) and its bytes, which must outlive the call.
struct CompoundStream {
    std::u16string name;
    std::span<const std::uint8_t> data;
};

// The bytes of a version 3 compound file holding these streams in its root storage. Streams
// shorter than 4096 bytes go to the mini stream, the others to whole sectors; files beyond what
// the header's 109 FAT slots can map get DIFAT sectors. The output depends on nothing but the
// input (zero CLSIDs and timestamps), so equal input gives equal bytes.
// Raises WriteError for a bad or repeated name or a file that would reach 2 GB.
std::vector<std::uint8_t> writeCompoundFile(std::span<const CompoundStream> streams);

} // namespace penmoor::xls
