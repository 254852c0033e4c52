#include "spreadsheet/xls/compoundfilereader.h"

#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/compoundfileformat.h"
#include "spreadsheet/xls/compoundfilenames.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/unicode.h"

#include <algorithm>
#include <cstring>

namespace penmoor::xls {

namespace {

using namespace cfb;

constexpr std::size_t kMinimumFileSize = 3 * kSectorSize;

std::string number(std::uint64_t value)
{
    return std::to_string(value);
}

// The sectors of a file; a final sector cut short by the end of the file reads as if padded
// with zeros.
class SectorFile {
public:
    explicit SectorFile(std::span<const std::uint8_t> file)
        : m_file(file)
        , m_sectorCount((file.size() - kHeaderSize + kSectorSize - 1) / kSectorSize)
    {
    }

    std::size_t sectorCount() const { return m_sectorCount; }

    void copySector(std::uint32_t sector, std::uint8_t* out, std::size_t count = kSectorSize) const
    {
        const std::size_t begin = kHeaderSize + std::size_t { sector } * kSectorSize;
        const std::size_t available = begin < m_file.size() ? std::min(count, m_file.size() - begin) : 0;
        if (available > 0)
            std::memcpy(out, m_file.data() + begin, available);
        std::memset(out + available, 0, count - available);
    }

    std::uint32_t sectorWord(std::uint32_t sector, std::size_t index) const
    {
        std::uint8_t word[4];
        copyAt(kHeaderSize + std::size_t { sector } * kSectorSize + 4 * index, word, 4);
        return loadU32(word);
    }

private:
    void copyAt(std::size_t begin, std::uint8_t* out, std::size_t count) const
    {
        for (std::size_t k = 0; k < count; ++k)
            out[k] = begin + k < m_file.size() ? m_file[begin + k] : 0;
    }

    std::span<const std::uint8_t> m_file;
    std::size_t m_sectorCount;
};

// The FAT and which chain owns each sector, so that a sector claimed twice (a loop, or two
// chains sharing it) is caught at once.
class SectorTables : public SectorFile {
public:
    explicit SectorTables(std::span<const std::uint8_t> file)
        : SectorFile(file)
        , m_owner(sectorCount(), 0)
    {
    }

    void checkSector(std::uint32_t sector, const std::string& what) const
    {
        if (sector >= sectorCount())
            throw FormatError("the " + what + " points to sector " + number(sector) + ", outside the file");
    }

    void claim(std::uint32_t sector, int owner, const std::string& what)
    {
        checkSector(sector, what);
        if (m_owner[sector] == owner)
            throw FormatError("the sector chain of the " + what + " loops");
        if (m_owner[sector] != 0)
            throw FormatError("the " + what + " uses sector " + number(sector) + ", which belongs to another part");
        m_owner[sector] = owner;
    }

    void setFat(std::vector<std::uint32_t> fat) { m_fat = std::move(fat); }

    // Follows a chain from its first sector to ENDOFCHAIN; each step is one claimed sector, so
    // the walk ends after at most sectorCount() steps.
    std::vector<std::uint32_t> walk(std::uint32_t first, int owner, const std::string& what)
    {
        std::vector<std::uint32_t> sectors;
        std::uint32_t sector = first;
        while (sector != kEndOfChain) {
            claim(sector, owner, what);
            if (sector >= m_fat.size())
                throw FormatError("the " + what + " reaches sector " + number(sector) + ", which the FAT does not map");
            sectors.push_back(sector);
            sector = m_fat[sector];
            if (sector != kEndOfChain && sector > kMaxRegularSector)
                throw FormatError("the sector chain of the " + what + " is broken");
        }
        return sectors;
    }

private:
    std::vector<int> m_owner;
    std::vector<std::uint32_t> m_fat;
};

enum Owner : int {
    kOwnerNone = 0,
    kOwnerFat,
    kOwnerDifat,
    kOwnerDirectory,
    kOwnerMiniFat,
    kOwnerMiniStream,
    kOwnerFirstStream,
};

void checkHeader(std::span<const std::uint8_t> file)
{
    if (file.size() < kMinimumFileSize)
        throw FormatError("the file is too short to be a compound file (" + number(file.size()) + " bytes)");
    if (!std::equal(kSignature.begin(), kSignature.end(), file.begin()))
        throw FormatError("the file does not start with the compound file signature");
    if (loadU16(&file[kHeaderByteOrder]) != kByteOrderMark)
        throw FormatError("the compound file header has a wrong byte order mark");
    const std::uint16_t major = loadU16(&file[kHeaderMajorVersion]);
    if (major == 4)
        throw FormatError("compound files of version 4 (4096-byte sectors) are not supported");
    if (major != kMajorVersion3)
        throw FormatError("the compound file has an unknown version " + number(major));
    if (loadU16(&file[kHeaderSectorShift]) != kSectorShift
        || loadU16(&file[kHeaderMiniSectorShift]) != kMiniSectorShift)
        throw FormatError("the compound file header has wrong sector sizes");
    if (loadU32(&file[kHeaderMiniStreamCutoff]) != kMiniStreamCutoff)
        throw FormatError("the compound file header has a wrong mini stream cutoff");
}

// Collects the FAT from the header's DIFAT slots and the DIFAT chain.
std::vector<std::uint32_t> readFat(std::span<const std::uint8_t> file, SectorTables& tables)
{
    const std::uint32_t fatCount = loadU32(&file[kHeaderFatSectorCount]);
    if (fatCount == 0 || fatCount > tables.sectorCount())
        throw FormatError("the header declares " + number(fatCount) + " FAT sectors in a file of "
            + number(tables.sectorCount()) + " sectors");
    std::vector<std::uint32_t> fatSectors;
    fatSectors.reserve(fatCount);
    auto add = [&](std::uint32_t sector) {
        if (sector == kFreeSector || fatSectors.size() == fatCount)
            return;
        tables.claim(sector, kOwnerFat, "FAT");
        fatSectors.push_back(sector);
    };
    for (std::size_t slot = 0; slot < kHeaderDifatSlots; ++slot)
        add(loadU32(&file[kHeaderDifat + 4 * slot]));

    const std::uint32_t difatCount = loadU32(&file[kHeaderDifatSectorCount]);
    std::uint32_t difat = loadU32(&file[kHeaderFirstDifatSector]);
    for (std::uint32_t step = 0; step < difatCount && fatSectors.size() < fatCount; ++step) {
        if (difat == kEndOfChain || difat == kFreeSector)
            break;
        tables.claim(difat, kOwnerDifat, "DIFAT");
        for (std::size_t k = 0; k < kFatSectorsPerDifatSector; ++k)
            add(tables.sectorWord(difat, k));
        difat = tables.sectorWord(difat, kFatSectorsPerDifatSector);
    }
    if (fatSectors.size() < fatCount)
        throw FormatError(
            "the header declares " + number(fatCount) + " FAT sectors but lists only " + number(fatSectors.size()));

    std::vector<std::uint32_t> fat(std::size_t { fatCount } * kEntriesPerFatSector);
    for (std::size_t i = 0; i < fatSectors.size(); ++i) {
        for (std::size_t k = 0; k < kEntriesPerFatSector; ++k)
            fat[i * kEntriesPerFatSector + k] = tables.sectorWord(fatSectors[i], k);
    }
    return fat;
}

std::vector<std::uint8_t> readChainBytes(const SectorFile& tables, const std::vector<std::uint32_t>& sectors)
{
    std::vector<std::uint8_t> bytes(sectors.size() * kSectorSize);
    for (std::size_t i = 0; i < sectors.size(); ++i)
        tables.copySector(sectors[i], bytes.data() + i * kSectorSize);
    return bytes;
}

struct RawEntry {
    std::u16string name;
    std::uint8_t type = kTypeUnused;
    std::uint32_t left = kNoStream;
    std::uint32_t right = kNoStream;
    std::uint32_t child = kNoStream;
    std::uint32_t start = 0;
    std::uint64_t size = 0;
};

RawEntry parseEntry(const std::uint8_t* at)
{
    RawEntry entry;
    entry.type = at[kEntryType];
    entry.left = loadU32(at + kEntryLeft);
    entry.right = loadU32(at + kEntryRight);
    entry.child = loadU32(at + kEntryChild);
    entry.start = loadU32(at + kEntryStartSector);
    // Version 3 sizes are below 2 GB; old writers left garbage in the high half, so it is ignored.
    entry.size = loadU32(at + kEntrySize);
    if (entry.type == kTypeUnused)
        return entry;
    const std::uint16_t nameBytes = loadU16(at + kEntryNameLength);
    if (nameBytes < 2 || nameBytes > 64 || nameBytes % 2 != 0)
        throw FormatError("a directory entry has a name length of " + number(nameBytes) + " bytes");
    for (std::size_t k = 0; k + 1 < nameBytes / 2u; ++k)
        entry.name += static_cast<char16_t>(loadU16(at + 2 * k));
    return entry;
}

// The root storage's children: walks the sibling tree without recursion, refusing ids outside
// the directory and entries met twice (a cycle).
std::vector<std::uint32_t> rootChildren(const std::vector<RawEntry>& entries)
{
    std::vector<bool> visited(entries.size(), false);
    visited[0] = true;
    std::vector<std::uint32_t> stack { entries[0].child };
    std::vector<std::uint32_t> children;
    while (!stack.empty()) {
        const std::uint32_t id = stack.back();
        stack.pop_back();
        if (id == kNoStream)
            continue;
        if (id >= entries.size())
            throw FormatError("the directory tree points to entry " + number(id) + ", outside the directory");
        if (visited[id])
            throw FormatError("the directory tree has a cycle");
        visited[id] = true;
        const RawEntry& entry = entries[id];
        if (entry.type != kTypeStream && entry.type != kTypeStorage)
            throw FormatError("the directory tree holds an entry of type " + number(entry.type));
        children.push_back(id);
        stack.push_back(entry.right);
        stack.push_back(entry.left);
    }
    std::sort(children.begin(), children.end(),
        [&](std::uint32_t a, std::uint32_t b) { return entryNameLess(entries[a].name, entries[b].name); });
    return children;
}

} // namespace

CompoundFileReader::CompoundFileReader(std::span<const std::uint8_t> file)
    : m_file(file)
{
    checkHeader(file);
    SectorTables tables(file);
    tables.setFat(readFat(file, tables));

    const auto directorySectors
        = tables.walk(loadU32(&file[kHeaderFirstDirectorySector]), kOwnerDirectory, "directory");
    if (directorySectors.empty())
        throw FormatError("the compound file has no directory");
    const std::vector<std::uint8_t> directory = readChainBytes(tables, directorySectors);
    std::vector<RawEntry> raw;
    raw.reserve(directory.size() / kDirectoryEntrySize);
    for (std::size_t offset = 0; offset < directory.size(); offset += kDirectoryEntrySize)
        raw.push_back(parseEntry(directory.data() + offset));
    if (raw[0].type != kTypeRoot)
        throw FormatError("the first directory entry is not the root entry");

    // The mini stream lives in the root entry's chain, the mini FAT in its own.
    const RawEntry& root = raw[0];
    std::vector<std::uint32_t> miniFat;
    std::size_t miniSectorCount = 0;
    if (root.size > 0) {
        m_miniStreamSectors = tables.walk(root.start, kOwnerMiniStream, "mini stream");
        if (root.size > m_miniStreamSectors.size() * kSectorSize)
            throw FormatError("the mini stream is larger than its sector chain");
        miniSectorCount = static_cast<std::size_t>((root.size + kMiniSectorSize - 1) / kMiniSectorSize);
        const std::uint32_t firstMiniFat = loadU32(&file[kHeaderFirstMiniFatSector]);
        const auto miniFatSectors = tables.walk(firstMiniFat, kOwnerMiniFat, "mini FAT");
        const std::vector<std::uint8_t> bytes = readChainBytes(tables, miniFatSectors);
        miniFat.resize(bytes.size() / 4);
        for (std::size_t k = 0; k < miniFat.size(); ++k)
            miniFat[k] = loadU32(bytes.data() + 4 * k);
    }
    std::vector<int> miniOwner(miniSectorCount, kOwnerNone);

    int owner = kOwnerFirstStream;
    for (std::uint32_t id : rootChildren(raw)) {
        const RawEntry& entry = raw[id];
        Entry visible { entry.name, entry.type == kTypeStream, entry.type == kTypeStream ? entry.size : 0 };
        StreamChain chain;
        const std::string what = "stream \"" + utf16ToUtf8(entry.name) + "\"";
        if (visible.isStream && entry.size > 0) {
            if (entry.size > file.size())
                throw FormatError("the " + what + " claims " + number(entry.size) + " bytes, more than the file holds");
            if (entry.size >= kMiniStreamCutoff) {
                chain.sectors = tables.walk(entry.start, owner, what);
                if (entry.size > chain.sectors.size() * kSectorSize)
                    throw FormatError("the " + what + " is larger than its sector chain");
            } else {
                chain.inMiniStream = true;
                std::uint32_t mini = entry.start;
                while (mini != kEndOfChain) {
                    if (mini >= miniSectorCount || mini >= miniFat.size())
                        throw FormatError("the " + what + " points outside the mini stream");
                    if (miniOwner[mini] == owner)
                        throw FormatError("the mini sector chain of the " + what + " loops");
                    if (miniOwner[mini] != kOwnerNone)
                        throw FormatError("the " + what + " shares a mini sector with another stream");
                    miniOwner[mini] = owner;
                    chain.sectors.push_back(mini);
                    mini = miniFat[mini];
                }
                if (entry.size > chain.sectors.size() * kMiniSectorSize)
                    throw FormatError("the " + what + " is larger than its mini sector chain");
            }
        }
        ++owner;
        m_entries.push_back(std::move(visible));
        m_chains.push_back(std::move(chain));
    }
}

std::optional<std::vector<std::uint8_t>> CompoundFileReader::readStream(std::u16string_view name) const
{
    for (std::size_t i = 0; i < m_entries.size(); ++i) {
        const Entry& entry = m_entries[i];
        if (!entry.isStream || !cfb::sameEntryName(entry.name, name))
            continue;
        const SectorFile sectors(m_file);
        std::vector<std::uint8_t> bytes(static_cast<std::size_t>(entry.size));
        const StreamChain& chain = m_chains[i];
        std::size_t done = 0;
        for (std::uint32_t sector : chain.sectors) {
            if (done == bytes.size())
                break;
            if (chain.inMiniStream) {
                // A mini sector lies inside one regular sector of the mini stream's chain.
                const std::size_t at = std::size_t { sector } * cfb::kMiniSectorSize;
                const std::size_t count = std::min(cfb::kMiniSectorSize, bytes.size() - done);
                std::uint8_t block[cfb::kSectorSize];
                sectors.copySector(m_miniStreamSectors[at / cfb::kSectorSize], block);
                std::memcpy(bytes.data() + done, block + at % cfb::kSectorSize, count);
                done += count;
            } else {
                const std::size_t count = std::min(cfb::kSectorSize, bytes.size() - done);
                sectors.copySector(sector, bytes.data() + done, count);
                done += count;
            }
        }
        return bytes;
    }
    return std::nullopt;
}

} // namespace penmoor::xls
