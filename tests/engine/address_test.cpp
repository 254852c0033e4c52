#include "automation/contract/error.h"
#include "spreadsheet/workbook/address.h"

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

TEST(ColumnLetters, CrossesEachLetterBoundary)
{
    const std::pair<int, const char*> cases[] = {
        { 1, "A" },
        { 26, "Z" },
        { 27, "AA" },
        { 52, "AZ" },
        { 53, "BA" },
        { 255, "IU" },
        { 256, "IV" },
    };
    for (const auto& [column, letters] : cases)
        EXPECT_EQ(columnLetters(column), letters) << column;
}

struct ParsedAddress {
    const char* text;
    Region expected;
    const char* absolute; // formatAddress of the result
};

TEST(ParseAddress, AcceptsCellsBlocksRowsAndColumnsInEitherCase)
{
    const ParsedAddress cases[] = {
        { "C5", Region::cell(5, 3), "$C$5" },
        { "c5", Region::cell(5, 3), "$C$5" },
        { "$C$5", Region::cell(5, 3), "$C$5" },
        { "C$5", Region::cell(5, 3), "$C$5" },
        { "B4:P51", { 4, 2, 51, 16 }, "$B$4:$P$51" },
        { "p51:b4", { 4, 2, 51, 16 }, "$B$4:$P$51" },
        { "B51:P4", { 4, 2, 51, 16 }, "$B$4:$P$51" },
        { "IV65536", Region::cell(65536, 256), "$IV$65536" },
        { "1:1", Region::rows(1, 1), "$1:$1" },
        { "$3:$5", Region::rows(3, 5), "$3:$5" },
        { "5:3", Region::rows(3, 5), "$3:$5" },
        { "A:A", Region::columns(1, 1), "$A:$A" },
        { "d:$IV", Region::columns(4, 256), "$D:$IV" },
        { "A1:IV1", Region::rows(1, 1), "$1:$1" },
        { "A1:A65536", Region::columns(1, 1), "$A:$A" },
        { "1:65536", Region::wholeSheet(), "$1:$65536" },
    };
    for (const ParsedAddress& c : cases) {
        const Region region = parseAddress(c.text);
        EXPECT_EQ(region, c.expected) << c.text;
        EXPECT_EQ(formatAddress(region), c.absolute) << c.text;
    }
    EXPECT_EQ(formatAddress({ 4, 2, 51, 16 }, AddressStyle::Relative), "B4:P51");
}

std::string parseError(const char* text)
{
    try {
        parseAddress(text);
    } catch (const xl::Error& error) {
        return error.what();
    }
    return "accepted";
}

TEST(ParseAddress, RejectsAddressesOutsideTheSheetNamingThem)
{
    for (const char* text : { "IW1", "A65537", "A0", "XFD1", "AAAAAAAAAAAA1", "A99999999999999999999", "B4:IW51", "0:1",
             "1:65537", "A:IW" }) {
        EXPECT_EQ(parseError(text),
            "The address \"" + std::string(text) + "\" is outside the sheet (columns A to IV, rows 1 to 65536).");
    }
}

TEST(ParseAddress, RejectsMalformedAddressesNamingThem)
{
    for (const char* text : { "", "A", "1", "5C", "C5:", ":C5", "A1:B", "A:1", "1:A", "A1:B2:C3", "A 1", "$", "$$A1",
             "A$", "A1$", "C5,D6", "R1C1", "É1" }) {
        const std::string message = parseError(text);
        EXPECT_NE(message.find("\"" + std::string(text) + "\" is not a valid"), std::string::npos)
            << text << ": " << message;
    }
}

} // namespace
} // namespace penmoor::engine
