#pragma once

#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/recordwriter.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace penmoor::xls {

// The workbook's shared string table: every text cell refers to its string by index, and equal
// texts share one entry.
class SharedStrings {
public:
    // The index of this UTF-8 text, adding it on first use; counts one more use.
    std::uint32_t add(std::string_view text);
    // The index of a text already added.
    std::uint32_t indexOf(std::string_view text) const { return m_index.find(text)->second; }

    std::uint32_t totalCount() const { return m_total; }
    std::uint32_t uniqueCount() const { return static_cast<std::uint32_t>(m_strings.size()); }
    const std::vector<std::u16string>& strings() const { return m_strings; }

private:
    // Looked up by string_view, so that finding a text already added allocates nothing.
    struct TextHash {
        using is_transparent = void;
        std::size_t operator()(std::string_view text) const { return std::hash<std::string_view> {}(text); }
    };
    std::unordered_map<std::string, std::uint32_t, TextHash, std::equal_to<>> m_index;
    std::vector<std::u16string> m_strings;
    std::uint32_t m_total = 0;
};

// Writes the SST record with its CONTINUE records, then EXTSST. A string's length and flags
// always stay in one record with at least its first character; where its characters run on
// into a CONTINUE record, that record starts with one flags byte giving their width.
void writeSharedStrings(RecordWriter& writer, const SharedStrings& strings);

// The strings of an SST record and its continuations, as UTF-8. The counts in the record are not
// trusted for sizing; a table that claims more strings than it holds raises FormatError.
std::vector<std::string> readSharedStrings(ContinuedReader& in);

} // namespace penmoor::xls
