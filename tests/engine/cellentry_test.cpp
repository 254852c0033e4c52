#include "automation/contract/error.h"
#include "spreadsheet/formula/cellentry.h"
#include "spreadsheet/formula/dates.h"
#include "spreadsheet/formula/valuetext.h"

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

struct EntryCase {
    const char* text;
    CellContent content;
    std::optional<std::string> format;
};

TEST(CellEntry, TypedTextBecomesNumbersDatesTextOrValues)
{
    const EntryCase cases[] = {
        { "2013", 2013.0, std::nullopt },
        { "-3.5", -3.5, std::nullopt },
        { " 42 ", 42.0, std::nullopt },
        { "+7", 7.0, std::nullopt },
        { "(7)", -7.0, std::nullopt },
        { "1,000", 1000.0, "#,##0" },
        { "1,234,567.5", 1234567.5, "#,##0.00" },
        { "10%", 0.1, "0%" },
        { "12.5%", 0.125, "0.00%" },
        { "1E3", 1000.0, "0.00E+00" },
        { "1/1/2013", 41275.0, "m/d/yyyy" },
        { "12-31-99", 36525.0, "m/d/yyyy" },
        { "2/29/1900", 60.0, "m/d/yyyy" },
        { "1/1/29", 47119.0, "m/d/yyyy" },
        { "1/1/30", 10959.0, "m/d/yyyy" },
        { "TRUE", true, std::nullopt },
        { "false", false, std::nullopt },
        { "#N/A", xl::ErrorValue::NA, std::nullopt },
        { "'2013", std::string("2013"), std::nullopt },
        { "'=1+1", std::string("=1+1"), std::nullopt },
        { "''", std::string("'"), std::nullopt },
        { "Week 1", std::string("Week 1"), std::nullopt },
        { "1-2", std::string("1-2"), std::nullopt },
        { "1,00", std::string("1,00"), std::nullopt },
        { "2/30/2013", std::string("2/30/2013"), std::nullopt },
        { "13/1/2013", std::string("13/1/2013"), std::nullopt },
        { "1/1/201", std::string("1/1/201"), std::nullopt },
        { "1/1/1899", std::string("1/1/1899"), std::nullopt },
        { "1/1-2013", std::string("1/1-2013"), std::nullopt },
        { "1e", std::string("1e"), std::nullopt },
        { ".", std::string("."), std::nullopt },
        { "--5", std::string("--5"), std::nullopt },
        { "", std::monostate {}, std::nullopt },
    };
    for (const EntryCase& c : cases) {
        const EnteredContent entered = parseCellEntry(c.text, "General");
        EXPECT_EQ(entered.content, c.content) << '"' << c.text << '"';
        EXPECT_EQ(entered.numberFormat, c.format) << '"' << c.text << '"';
    }
}

TEST(CellEntry, KeepsAFormatTheCellAlreadyHas)
{
    EXPECT_EQ(parseCellEntry("1/1/2013", "mmm-yy").numberFormat, std::nullopt);
    EXPECT_EQ(parseCellEntry("1/1/2013", "#,##0").numberFormat, "m/d/yyyy");
    EXPECT_EQ(parseCellEntry("10%", "#,##0").numberFormat, std::nullopt);
    EXPECT_EQ(parseCellEntry("1,000", "0.00").numberFormat, std::nullopt);
}

TEST(CellEntry, FormulasStartWithAnEqualsSignAndMustBeWellFormed)
{
    const EnteredContent entered = parseCellEntry("=RC[-1]+1", "General");
    ASSERT_TRUE(std::holds_alternative<Formula>(entered.content));
    EXPECT_EQ(std::get<Formula>(entered.content).tokens.size(), 3u);
    EXPECT_THROW(parseCellEntry("=RC[-1]+", "General"), xl::Error);
}

TEST(CellEntry, ReadsBackAsTheConstantWouldBeTyped)
{
    EXPECT_EQ(entryText(41275.0, "m/d/yyyy"), "1/1/2013");
    EXPECT_EQ(entryText(41275.0, "mmm-yy"), "1/1/2013");
    EXPECT_EQ(entryText(41275.5, "mmm-yy"), "41275.5");
    EXPECT_EQ(entryText(0.125, "0.00%"), "12.5%");
    EXPECT_EQ(entryText(1000.0, "#,##0"), "1000");
    EXPECT_EQ(entryText(0.1, "\"d\"0"), "0.1");
    EXPECT_EQ(entryText(std::string("Week 1"), "General"), "Week 1");
    EXPECT_EQ(entryText(xl::ErrorValue::Div0, "General"), "#DIV/0!");
    EXPECT_EQ(entryText(true, "General"), "TRUE");
    EXPECT_EQ(entryText(std::get<Formula>(parseCellEntry("=R[-7]C[0]+1", "General").content), "General"), "=R[-7]C+1");
}

TEST(NumberFormats, TellDateFormatsFromOthers)
{
    for (const char* format : { "mmm-yy", "m/d/yyyy", "d-mmm", "h:mm", "[Red]yyyy", "yyyy\" total\"" })
        EXPECT_TRUE(isDateFormat(format)) << format;
    for (const char* format : { "General", "general", "#,##0", "0.00%", "0.00E+00", "\"days\" 0", "[Red]0", "0\\d" })
        EXPECT_FALSE(isDateFormat(format)) << format;
}

TEST(NumberText, GeneralFormWithFifteenDigitsAndNoLocale)
{
    const std::pair<double, const char*> cases[] = {
        { 0.0, "0" },
        { -0.0, "0" },
        { 2013.0, "2013" },
        { -3.5, "-3.5" },
        { 0.1 + 0.2, "0.3" },
        { 1e20, "1E+20" },
        { 1.5e-7, "1.5E-07" },
        { 123456789012345.0, "123456789012345" },
        { 1.0 / 3.0, "0.333333333333333" },
    };
    for (const auto& [number, text] : cases)
        EXPECT_EQ(numberText(number), text) << number;
}

TEST(Dates, SerialsAndCalendarDatesAgreeAcrossThePhantomLeapDay)
{
    for (int serial : { 1, 59, 60, 61, 41275, 41306, 41609, kLastDateSerial }) {
        const std::optional<CalendarDate> date = calendarDate(serial);
        ASSERT_TRUE(date) << serial;
        EXPECT_EQ(dateSerial(date->year, date->month, date->day), serial) << serial;
    }
    EXPECT_EQ(calendarDate(1), (CalendarDate { 1900, 1, 1 }));
    EXPECT_EQ(calendarDate(59), (CalendarDate { 1900, 2, 28 }));
    EXPECT_EQ(calendarDate(60), (CalendarDate { 1900, 2, 29 }));
    EXPECT_EQ(calendarDate(61), (CalendarDate { 1900, 3, 1 }));
    EXPECT_EQ(calendarDate(41275.75), (CalendarDate { 2013, 1, 1 }));
    EXPECT_EQ(calendarDate(-1), std::nullopt);
    EXPECT_EQ(calendarDate(kLastDateSerial + 1), std::nullopt);
    EXPECT_EQ(dateSerial(2013, 1, 1), 41275);
    EXPECT_EQ(dateSerial(-1, 1, 1), std::nullopt);
    EXPECT_EQ(dateSerial(2013, 2147483647, 1), std::nullopt);
    EXPECT_EQ(dateSerial(2013, 1, -2147483647 - 1), std::nullopt);
}

} // namespace
} // namespace penmoor::engine
