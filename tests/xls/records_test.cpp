// The BIFF record layer: record bounds, and the shared string table split across CONTINUE
// records exactly as readers expect it.
#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/sharedstrings.h"
#include "spreadsheet/xls/unicode.h"
#include "tests/xls/support/recorddump.h"

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

std::vector<std::uint8_t> sstStream(const std::vector<std::string>& texts, std::size_t lead = 0)
{
    ByteBuffer out;
    out.zeros(lead); // records before the table move its absolute offsets
    RecordWriter writer(out);
    SharedStrings strings;
    for (const std::string& text : texts)
        strings.add(text);
    writeSharedStrings(writer, strings);
    return out.take();
}

std::vector<std::string> readBack(const std::vector<std::uint8_t>& stream, std::size_t lead = 0)
{
    RecordReader records(stream, lead);
    const Record first = records.next();
    EXPECT_EQ(first.type, biff::kSst);
    ContinuedReader in(first, records);
    auto strings = readSharedStrings(in);
    EXPECT_EQ(records.next().type, biff::kExtSst);
    EXPECT_TRUE(records.atEnd());
    return strings;
}

std::string repeat(const std::string& piece, std::size_t times)
{
    std::string text;
    for (std::size_t i = 0; i < times; ++i)
        text += piece;
    return text;
}

struct SstCase {
    const char* name;
    std::vector<std::string> texts;
};

class SharedStringTable : public ::testing::TestWithParam<SstCase> { };

TEST_P(SharedStringTable, ComesBackExactlyWithRecordsWithinTheLimit)
{
    const auto stream = sstStream(GetParam().texts);
    EXPECT_EQ(readBack(stream), GetParam().texts);
    RecordReader records(stream, 0);
    while (!records.atEnd())
        EXPECT_LE(records.next().body.size(), biff::kMaxRecordBody);
}

// A filler of n Latin-1 characters leaves 8224 - 8 - 3 - n bytes in the SST record.
std::string fillerLeaving(std::size_t room)
{
    return std::string(biff::kMaxRecordBody - 8 - 3 - room, 'f');
}

const SstCase kSstCases[] = {
    { "Empty", {} },
    { "EmptyString", { "" } },
    { "Labels", { "Cash flow", "Week 1", "TOTAL CASH RECEIPTS", "Cash on Hand (beginning of month)" } },
    { "AnyUnicode", { "Grüße", "Ωμέγα", "日本語", "emoji 😀 pair", "\xC2\xA0nbsp" } },
    { "LongLatin", { repeat("0123456789", 900) + "end" } },
    { "LongMixed", { repeat("abcΩ", 2000) + "xyz" } },
    // The next string's header meets the record end: it must move whole, with no flags byte.
    { "HeaderAtRecordEnd", { fillerLeaving(2), "moved" } },
    { "FirstCharacterAtRecordEnd", { fillerLeaving(3), "moved" } },
    { "WideCharacterAtRecordEnd", { fillerLeaving(4), "Ωsplit" } },
    { "SplitAfterOneCharacter", { fillerLeaving(4), "split here" } },
    { "WidthChangesAtBoundary", { fillerLeaving(40), repeat("a", 37) + repeat("Ω", 30) } },
    { "ManyStrings",
        [] {
            std::vector<std::string> texts;
            for (int i = 0; i < 3000; ++i)
                texts.push_back("Item " + std::to_string(i));
            return texts;
        }() },
};

INSTANTIATE_TEST_SUITE_P(Texts, SharedStringTable, ::testing::ValuesIn(kSstCases),
    [](const auto& test) { return std::string(test.param.name); });

TEST(SharedStringTable, EqualTextsShareOneEntry)
{
    SharedStrings strings;
    EXPECT_EQ(strings.add("a"), 0u);
    EXPECT_EQ(strings.add("b"), 1u);
    EXPECT_EQ(strings.add("a"), 0u);
    EXPECT_EQ(strings.totalCount(), 3u);
    EXPECT_EQ(strings.uniqueCount(), 2u);
}

TEST(SharedStringTable, SplitStringContinuesWithItsWidthFlag)
{
    const auto stream = sstStream({ fillerLeaving(4), "split here" });
    const auto lines = test::dumpRecords(stream);
    ASSERT_EQ(lines.size(), 3u); // SST, CONTINUE, EXTSST
    // "s" stays in the SST record; the CONTINUE record starts with flags 00 and "plit here".
    EXPECT_EQ(lines[1], "0x003C 10 00 70 6C 69 74 20 68 65 72 65");
}

TEST(SharedStringTable, ExtSstPointsAtEveryBucketsFirstString)
{
    std::vector<std::string> texts;
    for (int i = 0; i < 2500; ++i)
        texts.push_back("text number " + std::to_string(i) + repeat("x", i % 50));
    const std::size_t lead = 100;
    const auto stream = sstStream(texts, lead);
    ASSERT_EQ(readBack(stream, lead), texts);

    RecordReader records(stream, lead);
    Record record = records.next();
    while (record.type != biff::kExtSst)
        record = records.next();
    ByteReader ext(record.body, "EXTSST");
    const std::size_t perBucket = ext.u16();
    EXPECT_EQ(perBucket, 2500u / 128 + 1);
    for (std::size_t bucket = 0; ext.remaining() > 0; ++bucket) {
        const std::size_t at = ext.u32();
        const std::size_t inRecord = ext.u16();
        ext.u16();
        const std::string& text = texts.at(bucket * perBucket);
        EXPECT_EQ(loadU16(&stream.at(at)), text.size()) << "bucket " << bucket;
        const std::size_t recordStart = at - inRecord;
        const std::uint16_t type = loadU16(&stream.at(recordStart));
        EXPECT_TRUE(type == biff::kSst || type == biff::kContinue) << "bucket " << bucket;
    }
}

struct BrokenSst {
    const char* name;
    std::string body; // SST body in hex
};

class HostileSharedStrings : public ::testing::TestWithParam<BrokenSst> { };

TEST_P(HostileSharedStrings, IsRefused)
{
    std::vector<std::uint8_t> stream { 0xFC, 0x00, 0, 0 };
    const auto body = test::fromHex(GetParam().body);
    stream[2] = static_cast<std::uint8_t>(body.size());
    stream.insert(stream.end(), body.begin(), body.end());
    RecordReader records(stream, 0);
    const Record first = records.next();
    ContinuedReader in(first, records);
    EXPECT_THROW(readSharedStrings(in), FormatError);
}

const BrokenSst kBrokenSst[] = {
    { "CountsLie", "01 00 00 00 FF FF FF FF 01 00 00 41" },
    { "LengthLies", "01 00 00 00 01 00 00 00 FF FF 00 41 42" },
    { "WideLengthLies", "01 00 00 00 01 00 00 00 02 00 01 41 00 42" },
    { "ExtensionLies", "01 00 00 00 01 00 00 00 01 00 04 FF FF FF 7F 41" },
    { "RunsLie", "01 00 00 00 01 00 00 00 01 00 08 FF FF 41" },
    { "HeaderCut", "01 00 00 00 01 00 00 00 01" },
};

INSTANTIATE_TEST_SUITE_P(Faults, HostileSharedStrings, ::testing::ValuesIn(kBrokenSst),
    [](const auto& test) { return std::string(test.param.name); });

TEST(RecordReader, RefusesRecordsThatRunPastTheStream)
{
    const std::vector<std::uint8_t> cutBody { 0x0A, 0x00, 0x05, 0x00, 1, 2 };
    RecordReader body(cutBody, 0);
    EXPECT_THROW(body.next(), FormatError);
    const std::vector<std::uint8_t> cutHeader { 0x0A, 0x00, 0x00 };
    RecordReader header(cutHeader, 0);
    EXPECT_THROW(header.next(), FormatError);
    EXPECT_THROW(RecordReader(cutHeader, 4), FormatError);
}

} // namespace
} // namespace penmoor::xls
