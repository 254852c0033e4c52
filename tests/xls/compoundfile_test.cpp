// The compound file container: what goes in comes out, at the size edges of sectors, the mini
// stream and the DIFAT, with a directory that is a valid red-black tree.
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/compoundfileformat.h"
#include "spreadsheet/xls/compoundfilereader.h"
#include "spreadsheet/xls/compoundfilewriter.h"
#include "spreadsheet/xls/formaterror.h"
#include "tests/xls/support/cfbtestfiles.h"

#include <cctype>

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

using test::patternBytes;

std::vector<std::uint8_t> writeOne(const std::u16string& name, const std::vector<std::uint8_t>& data)
{
    const CompoundStream stream { name, data };
    return writeCompoundFile({ &stream, 1 });
}

class StreamSizes : public ::testing::TestWithParam<std::size_t> { };

TEST_P(StreamSizes, OneStreamComesBackExactly)
{
    const auto data = patternBytes(GetParam(), 7);
    const auto file = writeOne(u"Workbook", data);
    EXPECT_EQ(file.size() % cfb::kSectorSize, 0u);
    const CompoundFileReader reader(file);
    ASSERT_EQ(reader.entries().size(), 1u);
    EXPECT_EQ(reader.entries()[0].size, data.size());
    EXPECT_EQ(reader.readStream(u"workbook"), data) << "names are found without regard to letter case";
    EXPECT_FALSE(reader.readStream(u"Book").has_value());
}

INSTANTIATE_TEST_SUITE_P(
    Edges, StreamSizes, ::testing::Values(0, 1, 63, 64, 65, 511, 512, 513, 4095, 4096, 4097, 3 * 512, 65536 + 17));

TEST(CompoundFile, SmallAndLargeStreamsSideBySide)
{
    std::vector<std::vector<std::uint8_t>> data;
    std::vector<CompoundStream> streams;
    const std::vector<std::size_t> sizes { 4095, 0, 4096, 100, 20000, 1, 64 * 129 };
    for (std::size_t i = 0; i < sizes.size(); ++i)
        data.push_back(patternBytes(sizes[i], static_cast<int>(i)));
    for (std::size_t i = 0; i < sizes.size(); ++i)
        streams.push_back({ u"S" + std::u16string(i + 1, u'x'), data[i] });
    const auto file = writeCompoundFile(streams);
    const CompoundFileReader reader(file);
    ASSERT_EQ(reader.entries().size(), sizes.size());
    for (std::size_t i = 0; i < sizes.size(); ++i)
        EXPECT_EQ(reader.readStream(streams[i].name), data[i]) << "stream " << i;
    EXPECT_EQ(writeCompoundFile(streams), file) << "the same streams give the same bytes";
}

TEST(CompoundFile, RejectsBadNames)
{
    const std::vector<std::uint8_t> none;
    const CompoundStream same[] = { { u"Workbook", none }, { u"WORKBOOK", none } };
    EXPECT_THROW(writeCompoundFile(same), WriteError);
    const CompoundStream empty[] = { { u"", none } };
    EXPECT_THROW(writeCompoundFile(empty), WriteError);
    const CompoundStream longName[] = { { std::u16string(32, u'a'), none } };
    EXPECT_THROW(writeCompoundFile(longName), WriteError);
    const CompoundStream longest[] = { { std::u16string(31, u'a'), none } };
    EXPECT_NO_THROW(writeCompoundFile(longest));
}

std::uint32_t headerWord(const std::vector<std::uint8_t>& file, std::size_t offset)
{
    return loadU32(&file[offset]);
}

// 109 FAT sectors named in the header map 109 * 128 sectors, the FAT sectors themselves
// included; one more sector of data needs a 110th FAT sector and a DIFAT sector to list it.
TEST(CompoundFile, DifatBoundary)
{
    const std::size_t mappable = 109 * 128 - 109 - 1; // less the FAT and the directory sector
    for (std::size_t sectors : { mappable, mappable + 1 }) {
        const auto data = patternBytes(sectors * cfb::kSectorSize, 3);
        const auto file = writeOne(u"Workbook", data);
        const bool needsDifat = sectors > mappable;
        EXPECT_EQ(headerWord(file, cfb::kHeaderFatSectorCount), needsDifat ? 110u : 109u);
        EXPECT_EQ(headerWord(file, cfb::kHeaderDifatSectorCount), needsDifat ? 1u : 0u);
        EXPECT_EQ(headerWord(file, cfb::kHeaderFirstDifatSector), needsDifat ? 110u : cfb::kEndOfChain);
        const CompoundFileReader reader(file);
        EXPECT_EQ(reader.readStream(u"Workbook"), data) << sectors << " sectors";
    }
}

TEST(CompoundFile, ManyDifatSectors)
{
    // About 20 MB: 300-odd FAT sectors, listed by two chained DIFAT sectors.
    const auto data = patternBytes(20'000'000, 5);
    const auto file = writeOne(u"Workbook", data);
    EXPECT_EQ(headerWord(file, cfb::kHeaderDifatSectorCount), 2u);
    EXPECT_EQ(CompoundFileReader(file).readStream(u"Workbook"), data);
}

// The sibling tree of the root storage, checked as a binary search tree in the directory's name
// order and as a red-black tree (black root, no red node with a red child, equal black height).
int blackHeight(const std::vector<test::DirectoryEntry>& entries, std::uint32_t id, bool parentRed,
    std::vector<std::u16string>& inOrder)
{
    if (id == cfb::kNoStream)
        return 1;
    const auto& entry = entries.at(id);
    const bool red = entry.colour == cfb::kColourRed;
    EXPECT_FALSE(red && parentRed) << "red entry with a red parent";
    const int left = blackHeight(entries, entry.left, red, inOrder);
    inOrder.push_back(entry.name);
    const int right = blackHeight(entries, entry.right, red, inOrder);
    EXPECT_EQ(left, right) << "unequal black heights below an entry";
    return left + (red ? 0 : 1);
}

TEST(CompoundFile, DirectoryIsAValidRedBlackTree)
{
    const std::vector<std::uint8_t> none;
    for (std::size_t count = 1; count <= 16; ++count) {
        std::vector<CompoundStream> streams;
        for (std::size_t i = 0; i < count; ++i) {
            // Distinct names of mixed lengths and letter cases, given out of name order.
            const auto letter = static_cast<char16_t>((i % 2 ? u'A' : u'a') + i);
            streams.push_back({ std::u16string(1 + (i * 5) % 3, letter), none });
        }
        const auto file = writeCompoundFile(streams);
        const auto entries = test::directoryEntries(file);
        ASSERT_EQ(entries[0].colour, cfb::kColourBlack);
        const std::uint32_t top = entries[0].child;
        ASSERT_NE(top, cfb::kNoStream);
        EXPECT_EQ(entries[top].colour, cfb::kColourBlack) << count << " streams";
        std::vector<std::u16string> inOrder;
        blackHeight(entries, top, false, inOrder);
        ASSERT_EQ(inOrder.size(), count);
        for (std::size_t i = 1; i < inOrder.size(); ++i)
            EXPECT_TRUE(inOrder[i - 1].size() < inOrder[i].size()
                || (inOrder[i - 1].size() == inOrder[i].size()
                    && std::toupper(inOrder[i - 1][0]) < std::toupper(inOrder[i][0])))
                << count << " streams: out of order at " << i;
    }
}

} // namespace
} // namespace penmoor::xls
