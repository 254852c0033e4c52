#include "spreadsheet/xls/compoundfilewriter.h"

#include "spreadsheet/xls/bytebuffer.h"
#include "spreadsheet/xls/compoundfileformat.h"
#include "spreadsheet/xls/compoundfilenames.h"
#include "spreadsheet/xls/formaterror.h"

#include <algorithm>
#include <numeric>

namespace penmoor::xls {

namespace {

using namespace cfb;

// A v3 file must stay below 2 GB.
constexpr std::uint64_t kMaxFileSize = 0x7FFFFFFF;

std::size_t sectorsFor(std::size_t bytes, std::size_t sectorSize)
{
    return (bytes + sectorSize - 1) / sectorSize;
}

// Where each part of the file goes, in sectors counted from the first one after the header.
struct Layout {
    std::size_t fatSectors = 0;
    std::size_t difatSectors = 0;
    std::size_t directorySectors = 0;
    std::size_t miniFatSectors = 0;
    std::size_t miniStreamSectors = 0;
    std::size_t miniSectorCount = 0;
    std::vector<std::size_t> miniStart; // per input stream, first mini sector (small streams)
    std::vector<std::size_t> start; // per input stream, first sector (large streams)
    std::size_t totalSectors = 0;

    std::size_t firstDifat() const { return fatSectors; }
    std::size_t firstDirectory() const { return fatSectors + difatSectors; }
    std::size_t firstMiniFat() const { return firstDirectory() + directorySectors; }
    std::size_t firstMiniStream() const { return firstMiniFat() + miniFatSectors; }
};

bool isSmall(const CompoundStream& stream)
{
    return stream.data.size() < kMiniStreamCutoff;
}

Layout planLayout(std::span<const CompoundStream> streams)
{
    Layout layout;
    layout.miniStart.assign(streams.size(), 0);
    layout.start.assign(streams.size(), 0);
    for (std::size_t i = 0; i < streams.size(); ++i) {
        if (isSmall(streams[i])) {
            layout.miniStart[i] = layout.miniSectorCount;
            layout.miniSectorCount += sectorsFor(streams[i].data.size(), kMiniSectorSize);
        }
    }
    layout.miniStreamSectors = sectorsFor(layout.miniSectorCount * kMiniSectorSize, kSectorSize);
    layout.miniFatSectors = sectorsFor(layout.miniSectorCount, kEntriesPerFatSector);
    const std::size_t entries = 1 + streams.size();
    layout.directorySectors = sectorsFor(entries, kEntriesPerDirectorySector);

    std::size_t content = layout.directorySectors + layout.miniFatSectors + layout.miniStreamSectors;
    for (const CompoundStream& stream : streams) {
        if (!isSmall(stream))
            content += sectorsFor(stream.data.size(), kSectorSize);
    }
    // The FAT maps itself and the DIFAT too, so grow both until everything fits.
    std::size_t fat = 1;
    for (;;) {
        const std::size_t difat
            = fat > kHeaderDifatSlots ? sectorsFor(fat - kHeaderDifatSlots, kFatSectorsPerDifatSector) : 0;
        const std::size_t needed = content + fat + difat;
        if (needed <= fat * kEntriesPerFatSector) {
            layout.fatSectors = fat;
            layout.difatSectors = difat;
            layout.totalSectors = needed;
            break;
        }
        fat = sectorsFor(needed, kEntriesPerFatSector);
    }
    std::size_t next = layout.firstMiniStream() + layout.miniStreamSectors;
    for (std::size_t i = 0; i < streams.size(); ++i) {
        if (!isSmall(streams[i])) {
            layout.start[i] = next;
            next += sectorsFor(streams[i].data.size(), kSectorSize);
        }
    }
    return layout;
}

// Appends a chain of consecutive sectors (or mini sectors) to a FAT.
void chain(std::vector<std::uint32_t>& fat, std::size_t first, std::size_t count)
{
    for (std::size_t k = 0; k < count; ++k)
        fat[first + k] = k + 1 < count ? static_cast<std::uint32_t>(first + k + 1) : kEndOfChain;
}

std::vector<std::uint32_t> buildFat(const Layout& layout, std::span<const CompoundStream> streams)
{
    std::vector<std::uint32_t> fat(layout.fatSectors * kEntriesPerFatSector, kFreeSector);
    std::fill_n(fat.begin(), layout.fatSectors, kFatSector);
    std::fill_n(fat.begin() + static_cast<std::ptrdiff_t>(layout.firstDifat()), layout.difatSectors, kDifatSector);
    chain(fat, layout.firstDirectory(), layout.directorySectors);
    chain(fat, layout.firstMiniFat(), layout.miniFatSectors);
    chain(fat, layout.firstMiniStream(), layout.miniStreamSectors);
    for (std::size_t i = 0; i < streams.size(); ++i) {
        if (!isSmall(streams[i]))
            chain(fat, layout.start[i], sectorsFor(streams[i].data.size(), kSectorSize));
    }
    return fat;
}

std::vector<std::uint32_t> buildMiniFat(const Layout& layout, std::span<const CompoundStream> streams)
{
    std::vector<std::uint32_t> miniFat(layout.miniFatSectors * kEntriesPerFatSector, kFreeSector);
    for (std::size_t i = 0; i < streams.size(); ++i) {
        if (isSmall(streams[i]))
            chain(miniFat, layout.miniStart[i], sectorsFor(streams[i].data.size(), kMiniSectorSize));
    }
    return miniFat;
}

void writeHeader(ByteBuffer& out, const Layout& layout)
{
    out.append(kSignature);
    out.zeros(16); // CLSID
    out.u16(kMinorVersion);
    out.u16(kMajorVersion3);
    out.u16(kByteOrderMark);
    out.u16(kSectorShift);
    out.u16(kMiniSectorShift);
    out.zeros(6);
    out.u32(0); // directory sector count, always 0 in version 3
    out.u32(static_cast<std::uint32_t>(layout.fatSectors));
    out.u32(static_cast<std::uint32_t>(layout.firstDirectory()));
    out.u32(0); // transaction signature
    out.u32(kMiniStreamCutoff);
    out.u32(layout.miniFatSectors > 0 ? static_cast<std::uint32_t>(layout.firstMiniFat()) : kEndOfChain);
    out.u32(static_cast<std::uint32_t>(layout.miniFatSectors));
    out.u32(layout.difatSectors > 0 ? static_cast<std::uint32_t>(layout.firstDifat()) : kEndOfChain);
    out.u32(static_cast<std::uint32_t>(layout.difatSectors));
    for (std::size_t slot = 0; slot < kHeaderDifatSlots; ++slot)
        out.u32(slot < layout.fatSectors ? static_cast<std::uint32_t>(slot) : kFreeSector);
}

void writeTable(ByteBuffer& out, const std::vector<std::uint32_t>& table)
{
    for (std::uint32_t entry : table)
        out.u32(entry);
}

// DIFAT sectors list the FAT sectors beyond the header's 109, 127 to a sector, each ending
// with the number of the next DIFAT sector.
void writeDifat(ByteBuffer& out, const Layout& layout)
{
    std::size_t fatSector = kHeaderDifatSlots;
    for (std::size_t d = 0; d < layout.difatSectors; ++d) {
        for (std::size_t k = 0; k < kFatSectorsPerDifatSector; ++k, ++fatSector)
            out.u32(fatSector < layout.fatSectors ? static_cast<std::uint32_t>(fatSector) : kFreeSector);
        out.u32(d + 1 < layout.difatSectors ? static_cast<std::uint32_t>(layout.firstDifat() + d + 1) : kEndOfChain);
    }
}

struct DirectoryNode {
    std::uint32_t left = kNoStream;
    std::uint32_t right = kNoStream;
    std::uint8_t colour = kColourBlack;
};

// Builds a balanced sibling tree over entries 1..n (already in name order) and colours it as a
// valid red-black tree: a middle split leaves every leaf on the last or the second-last level,
// so making the last level red (when it is not full) keeps equal black heights.
std::uint32_t buildTree(std::vector<DirectoryNode>& nodes, std::size_t first, std::size_t last, int depth, int redDepth)
{
    if (first > last)
        return kNoStream;
    const std::size_t middle = first + (last - first) / 2;
    DirectoryNode& node = nodes[middle];
    node.colour = depth == redDepth ? kColourRed : kColourBlack;
    if (middle > first)
        node.left = buildTree(nodes, first, middle - 1, depth + 1, redDepth);
    node.right = buildTree(nodes, middle + 1, last, depth + 1, redDepth);
    return static_cast<std::uint32_t>(middle);
}

void writeEntry(ByteBuffer& out, std::u16string_view name, std::uint8_t type, const DirectoryNode& node,
    std::uint32_t child, std::uint32_t start, std::uint64_t size)
{
    for (char16_t unit : name)
        out.u16(unit);
    out.zeros(64 - 2 * name.size());
    out.u16(name.empty() ? 0 : static_cast<std::uint16_t>(2 * (name.size() + 1)));
    out.u8(type);
    out.u8(node.colour);
    out.u32(node.left);
    out.u32(node.right);
    out.u32(child);
    out.zeros(16 + 4 + 8 + 8); // CLSID, state bits, creation and modification times
    out.u32(start);
    out.u32(static_cast<std::uint32_t>(size));
    out.u32(static_cast<std::uint32_t>(size >> 32));
}

void writeDirectory(ByteBuffer& out, const Layout& layout, std::span<const CompoundStream> streams)
{
    // Entry ids follow the tree order, so entry k + 1 is the k-th name in that order.
    std::vector<std::size_t> order(streams.size());
    std::iota(order.begin(), order.end(), 0);
    std::sort(order.begin(), order.end(),
        [&](std::size_t a, std::size_t b) { return entryNameLess(streams[a].name, streams[b].name); });

    const std::size_t n = streams.size();
    std::vector<DirectoryNode> nodes(n + 1);
    int fullLevels = 0;
    while ((std::size_t { 1 } << (fullLevels + 1)) - 1 <= n)
        ++fullLevels;
    const bool perfect = (std::size_t { 1 } << fullLevels) - 1 == n;
    const int redDepth = perfect ? -1 : fullLevels;
    const std::uint32_t top = n > 0 ? buildTree(nodes, 1, n, 0, redDepth) : kNoStream;

    const std::uint32_t miniStreamStart
        = layout.miniStreamSectors > 0 ? static_cast<std::uint32_t>(layout.firstMiniStream()) : kEndOfChain;
    writeEntry(out, u"Root Entry", kTypeRoot, DirectoryNode {}, top, miniStreamStart,
        layout.miniSectorCount * kMiniSectorSize);
    for (std::size_t id = 1; id <= n; ++id) {
        const std::size_t i = order[id - 1];
        const CompoundStream& stream = streams[i];
        std::uint32_t start = kEndOfChain;
        if (!stream.data.empty())
            start = static_cast<std::uint32_t>(isSmall(stream) ? layout.miniStart[i] : layout.start[i]);
        writeEntry(out, stream.name, kTypeStream, nodes[id], kNoStream, start, stream.data.size());
    }
    for (std::size_t id = n + 1; id < layout.directorySectors * kEntriesPerDirectorySector; ++id)
        writeEntry(out, u"", kTypeUnused, DirectoryNode { kNoStream, kNoStream, kColourRed }, kNoStream, 0, 0);
}

void padTo(ByteBuffer& out, std::size_t unit)
{
    const std::size_t rest = out.size() % unit;
    if (rest != 0)
        out.zeros(unit - rest);
}

void checkNames(std::span<const CompoundStream> streams)
{
    for (std::size_t i = 0; i < streams.size(); ++i) {
        const std::u16string& name = streams[i].name;
        if (name.empty() || name.size() > kMaxNameUnits || name.find(u'\0') != std::u16string::npos)
            throw WriteError("a compound file stream name must have 1 to 31 characters");
        for (std::size_t j = 0; j < i; ++j) {
            if (sameEntryName(name, streams[j].name))
                throw WriteError("two compound file streams have the same name");
        }
    }
}

} // namespace

std::vector<std::uint8_t> writeCompoundFile(std::span<const CompoundStream> streams)
{
    checkNames(streams);
    const Layout layout = planLayout(streams);
    const std::uint64_t fileSize = kHeaderSize + std::uint64_t { layout.totalSectors } * kSectorSize;
    if (fileSize > kMaxFileSize)
        throw WriteError("the workbook would be larger than the 2 GB an .xls file can hold");

    ByteBuffer out(static_cast<std::size_t>(fileSize));
    writeHeader(out, layout);
    writeTable(out, buildFat(layout, streams));
    writeDifat(out, layout);
    writeDirectory(out, layout, streams);
    writeTable(out, buildMiniFat(layout, streams));
    for (const CompoundStream& stream : streams) {
        if (isSmall(stream)) {
            out.append(stream.data);
            padTo(out, kMiniSectorSize);
        }
    }
    padTo(out, kSectorSize);
    for (const CompoundStream& stream : streams) {
        if (!isSmall(stream)) {
            out.append(stream.data);
            padTo(out, kSectorSize);
        }
    }
    return out.take();
}

} // namespace penmoor::xls
