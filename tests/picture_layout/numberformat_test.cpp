#include "spreadsheet/picture/numberformat.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

struct Case {
    const char* format;
    xl::Value value;
    const char* shown;
};

std::string firstForm(const char* format, const xl::Value& value)
{
    const ShownValue shown = NumberFormat(format).show(value);
    return shown.forms.empty() ? std::string("<hashes>") : shown.forms.front().text;
}

void expectCases(const std::vector<Case>& cases)
{
    for (const Case& c : cases) {
        EXPECT_EQ(firstForm(c.format, c.value), c.shown) << "format " << c.format;
    }
}

TEST(NumberFormatTest, GeneralNumbersUseElevenCharactersAtMost)
{
    expectCases({
        { "General", 0.0, "0" },
        { "General", 2013.0, "2013" },
        { "General", -3.5, "-3.5" },
        { "General", 0.1 + 0.2, "0.3" }, // 15 significant digits hide the binary error
        { "General", 1.0 / 3.0, "0.333333333" },
        { "General", 2.0 / 3.0, "0.666666667" },
        { "General", -2.0 / 3.0, "-0.666666667" }, // the minus sign is not counted
        { "General", 12345678901.0, "12345678901" },
        { "General", 123456789012.0, "1.23457E+11" },
        { "General", 99999999999.6, "1E+11" },
        { "General", 1234567.891, "1234567.891" },
        { "General", 0.0001, "0.0001" },
        { "General", 0.0000123456, "1.23456E-05" },
        { "General", 1e100, "1E+100" },
        { "General", 1.23456789e100, "1.2346E+100" },
        { "general", 41275.0, "41275" },
    });
}

TEST(NumberFormatTest, GeneralShortensForNarrowCells)
{
    const ShownValue shown = NumberFormat("General").show(1234.5678);
    std::vector<std::string> texts;
    for (const ShownForm& form : shown.forms) {
        texts.push_back(form.text);
    }
    const std::vector<std::string> expected { "1234.5678", "1234.568", "1234.57", "1234.6", "1235", "1.23457E+03",
        "1.2346E+03", "1.235E+03", "1.23E+03", "1.2E+03", "1E+03" };
    EXPECT_EQ(texts, expected);
    EXPECT_TRUE(shown.isNumber);
}

TEST(NumberFormatTest, DigitPlaceholdersThousandsAndRounding)
{
    expectCases({
        { "#,##0", 0.0, "0" },
        { "#,##0", 1234.0, "1,234" },
        { "#,##0", 1234567.49, "1,234,567" },
        { "#,##0", -1234567.5, "-1,234,568" }, // halves round away from zero
        { "#,##0", 999.5, "1,000" },
        { "#,##0", 123.0, "123" },
        { "#,##0", 1e15, "1,000,000,000,000,000" },
        { "0", 2.5, "3" },
        { "0", -0.4, "-0" },
        { "0.00", 2.675, "2.68" }, // decimal rounding, not the binary neighbour
        { "0.00", 0.005, "0.01" },
        { "#,##0.00", 1234.5, "1,234.50" },
        { "#.##", 0.5, ".5" },
        { "0.0#", 1.0, "1.0" },
        { "0.0#", 1.25, "1.25" },
        { "000", 7.0, "007" },
        { "00-00", 1234.0, "12-34" },
        { "#,##0,", 1234567.0, "1,235" }, // a trailing comma divides by a thousand
        { "0.0,,", 12345678.0, "12.3" },
        { "?.??", 1.5, "1.5 " },
        { "#", 0.0, "" },
    });
}

TEST(NumberFormatTest, PercentScientificAndLiterals)
{
    expectCases({
        { "0%", 0.125, "13%" },
        { "0.00%", 0.145, "14.50%" },
        { "0.00E+00", 12345.0, "1.23E+04" },
        { "0.00E+00", 0.00012345, "1.23E-04" },
        { "0.00E-00", 12345.0, "1.23E04" },
        { "0.0E+0", 9.99, "1.0E+1" },
        { "##0.0E+0", 12345.0, "12.3E+3" },
        { "\"$\"#,##0", 1500.0, "$1,500" },
        { "#,##0\" kg\"", 12.0, "12 kg" },
        { "\\(0\\)", 5.0, "(5)" },
        { "$#,##0_);($#,##0)", 100.0, "$100 " },
        { "[$€-407] #,##0", 2.0, "€ 2" },
        { "\"Total\"", 7.0, "Total" },
    });
}

TEST(NumberFormatTest, SectionsChooseByValue)
{
    expectCases({
        { "#,##0;(#,##0)", 5.0, "5" },
        { "#,##0;(#,##0)", -5.0, "(5)" },
        { "#,##0;(#,##0)", 0.0, "0" },
        { "0;-0;\"zero\"", 0.0, "zero" },
        { "0;-0;\"zero\"", -3.0, "-3" },
        { "0;;", -3.0, "" },
        { "[>100]\"big\";[<0]\"negative\";0", 500.0, "big" },
        { "[>100]\"big\";[<0]\"negative\";0", -1.0, "negative" },
        { "[>100]\"big\";[<0]\"negative\";0", 50.0, "50" },
        { "0;0;0;\"<\"@\">\"", std::string("text"), "<text>" },
        { "@", std::string("label"), "label" },
        { "\"Item: \"@", std::string("rent"), "Item: rent" },
        { "#,##0", std::string("1,000"), "1,000" }, // text is shown as it is
        { "General;[Red]-General", -2.5, "-2.5" },
    });
    const ShownValue red = NumberFormat("0;[Red]0").show(-4.0);
    EXPECT_EQ(red.color, (FormatColor { FormatColor::Kind::Rgb, 0xFF0000 }));
    const ShownValue palette = NumberFormat("[Color10]0").show(4.0);
    EXPECT_EQ(palette.color, (FormatColor { FormatColor::Kind::Palette, 10 }));
}

TEST(NumberFormatTest, DatesInThe1900System)
{
    expectCases({
        { "mmm-yy", 41275.0, "Jan-13" },
        { "mmm-yy", 41609.0, "Dec-13" },
        { "m/d/yyyy", 41275.0, "1/1/2013" },
        { "d-mmm-yy", 41306.0, "1-Feb-13" },
        { "mmmm yyyy", 41306.0, "February 2013" },
        { "dd/mm/yy", 41340.0, "07/03/13" },
        { "m/d/yyyy", 1.0, "1/1/1900" },
        { "m/d/yyyy", 59.0, "2/28/1900" },
        { "m/d/yyyy", 60.0, "2/29/1900" }, // the phantom leap day
        { "m/d/yyyy", 61.0, "3/1/1900" },
        { "m/d/yyyy", 0.0, "1/0/1900" },
        { "m/d/yyyy", 2958465.0, "12/31/9999" },
        { "m/d/yyyy", 2958466.0, "<hashes>" },
        { "m/d/yyyy", -1.0, "<hashes>" },
        { "dddd, mmmm d", 41275.0, "Tuesday, January 1" },
        { "ddd", 1.0, "Sun" },
        { "mmmmm", 41275.0, "J" },
        { "yy", 36526.0, "00" },
    });
}

TEST(NumberFormatTest, TimesMinutesAndElapsed)
{
    expectCases({
        { "h:mm", 0.75, "18:00" },
        { "h:mm AM/PM", 0.75, "6:00 PM" },
        { "h:mm AM/PM", 0.0, "12:00 AM" },
        { "h:mm a/p", 0.5, "12:00 p" },
        { "hh:mm:ss", 41275.5 + 1.0 / 86400.0, "12:00:01" },
        { "mm:ss", 90.0 / 86400.0, "01:30" }, // minutes before seconds
        { "h:mm:ss", 0.99999999, "0:00:00" }, // rounds up into the next day
        { "[h]:mm", 1.5, "36:00" },
        { "[mm]:ss", 1.0 / 24.0, "60:00" },
        { "h:mm:ss.00", 1.2345 / 86400.0, "0:00:01.23" },
        { "m/d/yyyy h:mm", 41275.25, "1/1/2013 6:00" },
    });
}

TEST(NumberFormatTest, NonNumericValuesAndAlignment)
{
    expectCases({
        { "#,##0", true, "TRUE" },
        { "General", false, "FALSE" },
        { "General", xl::ErrorValue::Div0, "#DIV/0!" },
        { "0.00", xl::ErrorValue::NA, "#N/A" },
        { "General", std::string("Cash flow"), "Cash flow" },
    });
    EXPECT_EQ(generalSide(1.0), GeneralSide::Right);
    EXPECT_EQ(generalSide(std::string("x")), GeneralSide::Left);
    EXPECT_EQ(generalSide(true), GeneralSide::Center);
    EXPECT_EQ(generalSide(xl::ErrorValue::Ref), GeneralSide::Center);
    EXPECT_FALSE(NumberFormat("General").show(std::string("12")).isNumber);
}

TEST(NumberFormatTest, FillCharacterAndMalformedCodes)
{
    const ShownValue filled = NumberFormat("0*-").show(5.0);
    ASSERT_EQ(filled.forms.size(), 1u);
    EXPECT_EQ(filled.forms.front().text, "5");
    EXPECT_EQ(filled.forms.front().fillOffset, 1u);
    EXPECT_EQ(filled.forms.front().fillCharacter, "-");
    // Unbalanced quotes and brackets never fail; what is left shows as text.
    expectCases({
        { "0\"abc", 3.0, "3abc" }, { "0[", 3.0, "3[" }, { "", 3.0, "3" },
        { "0\\", 3.0, "3\\" }, // a trailing backslash still ends the section
    });
}

TEST(NumberFormatTest, EveryPrefixOfAnyCodeIsSafeToShow)
{
    // Cut anywhere (inside quotes, escapes, brackets, multi-byte characters), a code still
    // parses and shows every kind of value without reading out of bounds.
    const char* codes[] = {
        "[Red][>=100]#,##0.00_);[Blue](#,##0.00);\"zero\";@\" txt\"",
        "[$\xE2\x82\xAC-407] * #,##0.0,,E+00%",
        "[h]:mm:ss.000 AM/PM dddd mmmmm yy \\\\ _( *- ?/?",
        "\xE2\x82\xAC\\\xE2\x82\xAC"
        "0;[Color57]0;[<>0]0;[",
    };
    const xl::Value values[]
        = { 0.0, -1234.5678, 1e300, 5e-324, 41275.75, std::string("t"), true, xl::ErrorValue::Num };
    for (const char* code : codes) {
        const std::string full(code);
        for (std::size_t length = 0; length <= full.size(); ++length) {
            const NumberFormat format(full.substr(0, length));
            for (const xl::Value& value : values) {
                const ShownValue shown = format.show(value);
                for (const ShownForm& form : shown.forms) {
                    EXPECT_TRUE(form.fillOffset == std::string::npos || form.fillOffset <= form.text.size());
                }
            }
        }
    }
}

} // namespace
} // namespace penmoor::picture
