#include "spreadsheet/xls/sharedstrings.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/biffstrings.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/unicode.h"

#include <algorithm>

namespace penmoor::xls {

std::uint32_t SharedStrings::add(std::string_view text)
{
    ++m_total;
    if (const auto it = m_index.find(text); it != m_index.end())
        return it->second;
    const auto index = static_cast<std::uint32_t>(m_strings.size());
    m_index.emplace(std::string(text), index);
    m_strings.push_back(utf8ToUtf16(text));
    return index;
}

namespace {

// EXTSST: one bucket per dsst strings, each pointing at its first string.
struct Bucket {
    std::uint32_t streamOffset = 0;
    std::uint16_t recordOffset = 0;
};

std::uint16_t stringsPerBucket(std::uint32_t unique)
{
    return static_cast<std::uint16_t>(std::max<std::uint32_t>(unique / 128 + 1, 8));
}

// Spreads the table over SST and CONTINUE records.
class SstSplitter {
public:
    explicit SstSplitter(RecordWriter& writer)
        : m_writer(writer)
    {
    }

    void start(const SharedStrings& strings)
    {
        m_writer.begin(biff::kSst);
        m_recordStart = m_writer.offset() - biff::kRecordHeaderSize;
        m_writer.out().u32(strings.totalCount());
        m_writer.out().u32(strings.uniqueCount());
    }

    Bucket add(std::u16string_view text)
    {
        const bool wide = !fitsInOneByte(text);
        const std::size_t width = wide ? 2 : 1;
        // Length, flags and the first character stay together.
        if (room() < 3 + (text.empty() ? 0 : width))
            next();
        const Bucket bucket { static_cast<std::uint32_t>(m_writer.offset()),
            static_cast<std::uint16_t>(m_writer.offset() - m_recordStart) };
        ByteBuffer& out = m_writer.out();
        out.u16(static_cast<std::uint16_t>(text.size()));
        out.u8(wide ? biff::kStringHighByte : 0);
        while (!text.empty()) {
            const std::size_t count = std::min(text.size(), room() / width);
            writeCharacters(out, text.substr(0, count), wide);
            text.remove_prefix(count);
            if (!text.empty()) {
                next();
                out.u8(wide ? biff::kStringHighByte : 0);
            }
        }
        return bucket;
    }

    void finish() { m_writer.end(); }

private:
    std::size_t room() const { return biff::kMaxRecordBody - m_writer.bodySize(); }
    void next()
    {
        m_writer.end();
        m_writer.begin(biff::kContinue);
        m_recordStart = m_writer.offset() - biff::kRecordHeaderSize;
    }

    RecordWriter& m_writer;
    std::size_t m_recordStart = 0;
};

} // namespace

void writeSharedStrings(RecordWriter& writer, const SharedStrings& strings)
{
    const std::uint16_t perBucket = stringsPerBucket(strings.uniqueCount());
    std::vector<Bucket> buckets;
    SstSplitter splitter(writer);
    splitter.start(strings);
    for (std::size_t i = 0; i < strings.strings().size(); ++i) {
        const Bucket bucket = splitter.add(strings.strings()[i]);
        if (i % perBucket == 0)
            buckets.push_back(bucket);
    }
    splitter.finish();

    writer.begin(biff::kExtSst);
    writer.out().u16(perBucket);
    for (const Bucket& bucket : buckets) {
        writer.out().u32(bucket.streamOffset);
        writer.out().u16(bucket.recordOffset);
        writer.out().u16(0);
    }
    writer.end();
}

std::vector<std::string> readSharedStrings(ContinuedReader& in)
{
    in.u32(); // uses of the strings in cells
    const std::uint32_t unique = in.u32();
    std::vector<std::string> strings;
    // Every string takes at least three bytes, which bounds what a lying count can reserve.
    strings.reserve(std::min<std::size_t>(unique, in.remaining() / 3));
    for (std::uint32_t i = 0; i < unique; ++i) {
        if (in.remaining() == 0)
            throw FormatError("the shared string table holds fewer strings than it claims");
        const std::uint16_t length = in.u16();
        const std::uint8_t flags = in.u8();
        const std::uint16_t runs = (flags & biff::kStringRichText) ? in.u16() : 0;
        const std::uint32_t extension = (flags & biff::kStringExtended) ? in.u32() : 0;
        strings.push_back(utf16ToUtf8(in.characters(length, (flags & biff::kStringHighByte) != 0)));
        in.skip(4 * std::size_t { runs });
        in.skip(extension);
    }
    return strings;
}

} // namespace penmoor::xls
