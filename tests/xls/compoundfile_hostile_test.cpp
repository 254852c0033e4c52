// A compound file reader meets hostile input as normal input: every fault gives FormatError
// with a reason, in bounded time and memory, never a crash or a hang.
#include "spreadsheet/xls/compoundfilereader.h"
#include "spreadsheet/xls/compoundfilewriter.h"
#include "spreadsheet/xls/formaterror.h"
#include "tests/xls/support/cfbtestfiles.h"

#include <functional>
#include <random>

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

using test::putU16;
using test::putU32;

constexpr std::uint32_t kEnd = 0xFFFFFFFE;
constexpr std::uint32_t kFree = 0xFFFFFFFF;

// Two streams: "Small" (100 bytes, two mini sectors) and "Workbook" (5000 bytes, ten sectors).
struct SampleFile {
    std::vector<std::uint8_t> small = test::patternBytes(100, 1);
    std::vector<std::uint8_t> large = test::patternBytes(5000, 2);
    std::vector<std::uint8_t> bytes;
    std::uint32_t workbookStart = 0;
    std::uint32_t miniFatSector = 0;

    SampleFile()
    {
        const CompoundStream streams[] = { { u"Workbook", large }, { u"Small", small } };
        bytes = writeCompoundFile(streams);
        for (const auto& entry : test::directoryEntries(bytes)) {
            if (entry.name == u"Workbook")
                workbookStart = entry.start;
        }
        miniFatSector = bytes[0x3C] | (bytes[0x3D] << 8);
    }
    static std::size_t sector(std::uint32_t s) { return 512 + 512 * std::size_t { s }; }
    std::size_t fatEntry(std::uint32_t s) const { return sector(0) + 4 * std::size_t { s }; }
    // Entry ids follow the name order: 1 "Small", 2 "Workbook".
    std::size_t entry(std::uint32_t id) const { return test::directoryEntryOffset(bytes, id); }
};

struct HostileCase {
    const char* name;
    std::function<void(SampleFile&)> damage;
    const char* reason; // a part of the expected message
};

class HostileCompoundFile : public ::testing::TestWithParam<HostileCase> { };

TEST_P(HostileCompoundFile, IsRefusedWithItsReason)
{
    SampleFile file;
    ASSERT_NO_THROW(CompoundFileReader { file.bytes });
    GetParam().damage(file);
    try {
        const CompoundFileReader reader(file.bytes);
        (void)reader.readStream(u"Workbook");
        FAIL() << "damaged file was accepted";
    } catch (const FormatError& error) {
        EXPECT_NE(std::string(error.what()).find(GetParam().reason), std::string::npos) << error.what();
    }
}

const HostileCase kHostileCases[] = {
    { "Truncated", [](SampleFile& f) { f.bytes.resize(1000); }, "too short" },
    { "EmptyFile", [](SampleFile& f) { f.bytes.clear(); }, "too short" },
    { "NotACompoundFile", [](SampleFile& f) { f.bytes[0] = 'P'; }, "signature" },
    { "ByteOrder", [](SampleFile& f) { putU16(f.bytes, 0x1C, 0xFEFF); }, "byte order" },
    { "Version4", [](SampleFile& f) { putU16(f.bytes, 0x1A, 4); }, "version 4" },
    { "SectorShift", [](SampleFile& f) { putU16(f.bytes, 0x1E, 12); }, "sector sizes" },
    { "CutShortInsideAStream", [](SampleFile& f) { f.bytes.resize(SampleFile::sector(f.workbookStart + 9)); },
        "outside the file" },
    { "ChainLoops", [](SampleFile& f) { putU32(f.bytes, f.fatEntry(f.workbookStart + 3), f.workbookStart); }, "loops" },
    { "ChainPointsOutside", [](SampleFile& f) { putU32(f.bytes, f.fatEntry(f.workbookStart + 3), 100000); },
        "outside the file" },
    { "ChainBroken", [](SampleFile& f) { putU32(f.bytes, f.fatEntry(f.workbookStart + 3), kFree); }, "broken" },
    { "ChainsShareASector", [](SampleFile& f) { putU32(f.bytes, f.fatEntry(f.workbookStart + 9), 0); },
        "belongs to another part" },
    { "StreamSizeBeyondFile", [](SampleFile& f) { putU32(f.bytes, f.entry(2) + 0x78, 50'000'000); },
        "more than the file holds" },
    { "StreamSizeBeyondChain", [](SampleFile& f) { putU32(f.bytes, f.entry(2) + 0x78, 6000); },
        "larger than its sector chain" },
    { "DirectoryCycle", [](SampleFile& f) { putU32(f.bytes, f.entry(2) + 0x44, 0); }, "cycle" },
    { "DirectoryEntryOutside", [](SampleFile& f) { putU32(f.bytes, f.entry(0) + 0x4C, 77); }, "outside the directory" },
    { "OddNameLength", [](SampleFile& f) { putU16(f.bytes, f.entry(1) + 0x40, 7); }, "name length" },
    { "NoRootEntry", [](SampleFile& f) { f.bytes[f.entry(0) + 0x42] = 2; }, "root entry" },
    { "UnusedEntryInTree", [](SampleFile& f) { f.bytes[f.entry(1) + 0x42] = 0; }, "type 0" },
    { "MiniChainLoops", [](SampleFile& f) { putU32(f.bytes, SampleFile::sector(f.miniFatSector) + 4, 0); }, "loops" },
    { "MiniChainOutside", [](SampleFile& f) { putU32(f.bytes, SampleFile::sector(f.miniFatSector) + 4, 5000); },
        "outside the mini stream" },
    { "TooManyFatSectors", [](SampleFile& f) { putU32(f.bytes, 0x2C, 0xFFFFFFFF); }, "FAT sectors" },
    { "FatSectorsMissing", [](SampleFile& f) { putU32(f.bytes, 0x2C, 2); }, "lists only" },
    { "DifatLoops",
        [](SampleFile& f) {
            // A second FAT sector is promised through a DIFAT sector that names only itself.
            putU32(f.bytes, 0x2C, 2);
            putU32(f.bytes, 0x44, f.workbookStart);
            putU32(f.bytes, 0x48, 1000);
            for (std::size_t k = 0; k < 127; ++k)
                putU32(f.bytes, SampleFile::sector(f.workbookStart) + 4 * k, kFree);
            putU32(f.bytes, SampleFile::sector(f.workbookStart) + 4 * 127, f.workbookStart);
        },
        "loops" },
    { "DirectoryChainEmpty", [](SampleFile& f) { putU32(f.bytes, 0x30, kEnd); }, "no directory" },
};

INSTANTIATE_TEST_SUITE_P(Faults, HostileCompoundFile, ::testing::ValuesIn(kHostileCases),
    [](const auto& test) { return std::string(test.param.name); });

// Random damage anywhere in the header, the tables and the directory: the reader either reads
// the file or refuses it, and never reads outside it (the sanitizers watch).
TEST(HostileCompoundFile, RandomDamageIsReadOrRefused)
{
    const SampleFile sample;
    std::mt19937 random(20130101);
    std::uniform_int_distribution<std::size_t> where(0, 4 * 512);
    std::uniform_int_distribution<int> value(0, 255);
    int refused = 0;
    for (int round = 0; round < 3000; ++round) {
        auto bytes = sample.bytes;
        for (int k = 0; k < 1 + round % 4; ++k)
            bytes[where(random)] = static_cast<std::uint8_t>(value(random));
        try {
            const CompoundFileReader reader(bytes);
            for (const auto& entry : reader.entries()) {
                const auto data = reader.readStream(entry.name);
                if (data) {
                    EXPECT_LE(data->size(), bytes.size());
                }
            }
        } catch (const FormatError&) {
            ++refused;
        }
    }
    EXPECT_GT(refused, 0);
}

} // namespace
} // namespace penmoor::xls
