#include "tests/xls/support/recorddump.h"

#include "spreadsheet/xls/recordreader.h"

#include <algorithm>
#include <cstdio>
#include <sstream>

namespace penmoor::xls::test {

std::string hex(std::span<const std::uint8_t> bytes)
{
    std::string text;
    char digits[4];
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        std::snprintf(digits, sizeof digits, i == 0 ? "%02X" : " %02X", bytes[i]);
        text += digits;
    }
    return text;
}

std::vector<std::uint8_t> fromHex(const std::string& text)
{
    std::vector<std::uint8_t> bytes;
    std::istringstream in(text);
    for (std::string word; in >> word;)
        bytes.push_back(static_cast<std::uint8_t>(std::stoul(word, nullptr, 16)));
    return bytes;
}

std::vector<std::string> dumpRecords(std::span<const std::uint8_t> stream)
{
    std::vector<std::string> lines;
    RecordReader records(stream, 0);
    while (!records.atEnd()) {
        const auto rest = stream.subspan(records.offset());
        if (std::all_of(rest.begin(), rest.end(), [](std::uint8_t b) { return b == 0; }))
            break;
        const Record record = records.next();
        char head[24];
        std::snprintf(head, sizeof head, "0x%04X %zu", record.type, record.body.size());
        lines.push_back(std::string(head) + (record.body.empty() ? "" : " " + hex(record.body)));
    }
    return lines;
}

} // namespace penmoor::xls::test
