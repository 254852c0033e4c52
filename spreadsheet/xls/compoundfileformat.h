#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

// The fixed values of a version 3 compound file (OLE2 structured storage): 512-byte sectors,
// 64-byte mini sectors, streams shorter than 4096 bytes kept in the mini stream.
namespace penmoor::xls::cfb {

inline constexpr std::array<std::uint8_t, 8> kSignature { 0xD0, 0xCF, 0x11, 0xE0, 0xA1, 0xB1, 0x1A, 0xE1 };
inline constexpr std::uint16_t kMinorVersion = 0x003E;
inline constexpr std::uint16_t kMajorVersion3 = 0x0003;
inline constexpr std::uint16_t kByteOrderMark = 0xFFFE;
inline constexpr std::uint16_t kSectorShift = 9;
inline constexpr std::uint16_t kMiniSectorShift = 6;

inline constexpr std::size_t kSectorSize = 512;
inline constexpr std::size_t kMiniSectorSize = 64;
inline constexpr std::size_t kHeaderSize = 512;
inline constexpr std::uint32_t kMiniStreamCutoff = 4096;
inline constexpr std::size_t kEntriesPerFatSector = kSectorSize / 4;
// A DIFAT sector holds 127 FAT sector numbers and the number of the next DIFAT sector.
inline constexpr std::size_t kFatSectorsPerDifatSector = kEntriesPerFatSector - 1;
inline constexpr std::size_t kHeaderDifatSlots = 109;
inline constexpr std::size_t kDirectoryEntrySize = 128;
inline constexpr std::size_t kEntriesPerDirectorySector = kSectorSize / kDirectoryEntrySize;
// Names are at most 31 UTF-16 code units plus the terminating NUL.
inline constexpr std::size_t kMaxNameUnits = 31;

// Special sector numbers.
inline constexpr std::uint32_t kMaxRegularSector = 0xFFFFFFFA;
inline constexpr std::uint32_t kDifatSector = 0xFFFFFFFC;
inline constexpr std::uint32_t kFatSector = 0xFFFFFFFD;
inline constexpr std::uint32_t kEndOfChain = 0xFFFFFFFE;
inline constexpr std::uint32_t kFreeSector = 0xFFFFFFFF;
inline constexpr std::uint32_t kNoStream = 0xFFFFFFFF;

// Directory entry object types and colours.
inline constexpr std::uint8_t kTypeUnused = 0;
inline constexpr std::uint8_t kTypeStorage = 1;
inline constexpr std::uint8_t kTypeStream = 2;
inline constexpr std::uint8_t kTypeRoot = 5;
inline constexpr std::uint8_t kColourRed = 0;
inline constexpr std::uint8_t kColourBlack = 1;

// Header field offsets.
inline constexpr std::size_t kHeaderMinorVersion = 0x18;
inline constexpr std::size_t kHeaderMajorVersion = 0x1A;
inline constexpr std::size_t kHeaderByteOrder = 0x1C;
inline constexpr std::size_t kHeaderSectorShift = 0x1E;
inline constexpr std::size_t kHeaderMiniSectorShift = 0x20;
inline constexpr std::size_t kHeaderFatSectorCount = 0x2C;
inline constexpr std::size_t kHeaderFirstDirectorySector = 0x30;
inline constexpr std::size_t kHeaderMiniStreamCutoff = 0x38;
inline constexpr std::size_t kHeaderFirstMiniFatSector = 0x3C;
inline constexpr std::size_t kHeaderMiniFatSectorCount = 0x40;
inline constexpr std::size_t kHeaderFirstDifatSector = 0x44;
inline constexpr std::size_t kHeaderDifatSectorCount = 0x48;
inline constexpr std::size_t kHeaderDifat = 0x4C;

// Directory entry field offsets.
inline constexpr std::size_t kEntryNameLength = 0x40;
inline constexpr std::size_t kEntryType = 0x42;
inline constexpr std::size_t kEntryColour = 0x43;
inline constexpr std::size_t kEntryLeft = 0x44;
inline constexpr std::size_t kEntryRight = 0x48;
inline constexpr std::size_t kEntryChild = 0x4C;
inline constexpr std::size_t kEntryStartSector = 0x74;
inline constexpr std::size_t kEntrySize = 0x78;

} // namespace penmoor::xls::cfb
