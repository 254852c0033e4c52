#include "model/memorywindowview.h"
#include "tests/support/scripteddialogs.h"
#include "ui/main/periodchecks.h"

#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

constexpr int kThisYear = 2031;

const std::string kYearTooEarly = "Year can't be less then 1970.\r\nPlease change year to necessary value.";
const std::string kTooFewWeeks = "Week number can't be less then 1.\r\nPlease change week's number to necessary value.";
const std::string kTooManyWeeks
    = "Week number can't be greater then 100.\r\nPlease change week's number to necessary value.";
const std::string kStartAfterEnd
    = "Start year can't be greater then end year.\r\nPlease change year to necessary value.";
const std::string kYearModeSpan = "Start year can't be greater then end year by more then 100 years in Year mode.\r\n"
                                  "Please change year to necessary value.";
const std::string kMonthModeSpan = "Start year can't be greater then end year by more then 10 years in Month mode.\r\n"
                                   "Please change year to necessary value.";

struct Case {
    std::string text;
    std::int64_t value;
    std::optional<std::string> problem;
};

void expectChecked(const CheckedValue& checked, const Case& expected)
{
    EXPECT_EQ(checked.value, expected.value);
    EXPECT_EQ(checked.problem, expected.problem);
}

TEST(YearCheck, TwoDigitYearsCountFromTwoThousandAndEarlyYearsBecomeThisYear)
{
    const std::vector<Case> cases = {
        { "13", 2013, std::nullopt },
        { "0", 2000, std::nullopt },
        { "", 2000, std::nullopt },
        { "abc", 2000, std::nullopt },
        { "99", 2099, std::nullopt },
        { "-5", 1995, std::nullopt },
        { "2013abc", 2013, std::nullopt },
        { " 2013 ", 2013, std::nullopt },
        { "1970", 1970, std::nullopt },
        { "2012.5", 2012, std::nullopt },
        { "2013.5", 2014, std::nullopt },
        { "1969", kThisYear, kYearTooEarly },
        { "100", kThisYear, kYearTooEarly },
        { "-50", kThisYear, kYearTooEarly },
        { "-99999999999", kThisYear, kYearTooEarly },
    };
    for (const Case& c : cases) {
        SCOPED_TRACE("\"" + c.text + "\"");
        expectChecked(checkYear(c.text, kThisYear), c);
    }
}

TEST(WeeksCheck, KeepsOneToOneHundredWeeksRoundingHalvesToEven)
{
    const std::vector<Case> cases = {
        { "5", 5, std::nullopt },
        { "1", 1, std::nullopt },
        { "100", 100, std::nullopt },
        { "5.5", 6, std::nullopt },
        { "6.5", 6, std::nullopt },
        { "0.5", 1, kTooFewWeeks },
        { "0", 1, kTooFewWeeks },
        { "-3", 1, kTooFewWeeks },
        { "", 1, kTooFewWeeks },
        { "many", 1, kTooFewWeeks },
        { "101", 100, kTooManyWeeks },
        { "250", 100, kTooManyWeeks },
        { "1e9", 1, std::nullopt },
    };
    for (const Case& c : cases) {
        SCOPED_TRACE("\"" + c.text + "\"");
        expectChecked(checkWeeks(c.text), c);
    }
}

TEST(YearPairCheck, EndYearMayNeitherPrecedeTheStartNorLeaveTheModesSpan)
{
    struct PairCase {
        PeriodMode mode;
        std::string start;
        std::string end;
        Case expected;
    };
    const std::vector<PairCase> cases = {
        { PeriodMode::ByYear, "2015", "2013", { "", 2015, kStartAfterEnd } },
        { PeriodMode::ByYear, "1990", "2095", { "", 1990, kYearModeSpan } },
        { PeriodMode::ByYear, "1990", "2090", { "", 2090, std::nullopt } },
        { PeriodMode::ByYear, "2013", "2013", { "", 2013, std::nullopt } },
        { PeriodMode::ByYear, "2013", "2014.5", { "", 2014, std::nullopt } },
        { PeriodMode::ByMonth, "2013", "2023", { "", 2023, std::nullopt } },
        { PeriodMode::ByMonth, "2013", "2024", { "", 2013, kMonthModeSpan } },
        { PeriodMode::ByMonth, "2014", "2013", { "", 2014, kStartAfterEnd } },
        // An emptied first year would otherwise ask for two thousand years of months.
        { PeriodMode::ByMonth, "", "2013", { "", 0, kMonthModeSpan } },
        { PeriodMode::ByMonth, "", "", { "", 0, std::nullopt } },
        // The week mode has no years to check; the end box still gets its whole number.
        { PeriodMode::ByWeek, "2015", "2013", { "", 2013, std::nullopt } },
        { PeriodMode::ByWeek, "1990", "2095", { "", 2095, std::nullopt } },
        { PeriodMode::ByWeek, "2013", "next year", { "", 0, std::nullopt } },
    };
    for (const PairCase& c : cases) {
        SCOPED_TRACE("\"" + c.start + "\" to \"" + c.end + "\"");
        expectChecked(checkYearPair(c.mode, c.start, c.end), c.expected);
    }
}

class WindowChecks : public ::testing::Test {
protected:
    void SetUp() override
    {
        for (const TextBox box : { TextBox::Text2, TextBox::Text3, TextBox::Text6, TextBox::Text7 }) {
            view.setText(box, "2013");
        }
        view.setText(TextBox::Text4, "5");
    }

    void select(OptionButton button) { view.setOptionOn(button, true); }

    MemoryWindowView view;
    testing::ScriptedDialogs dialogs;
};

TEST_F(WindowChecks, ValidateYearWritesTheCorrectedYearBackAndSaysSo)
{
    view.setText(TextBox::Text2, "1969");
    dialogs.expect(MessageRequest::inputProblem(kYearTooEarly));
    EXPECT_TRUE(ValidateYear(view, TextBox::Text2, dialogs, kThisYear));
    EXPECT_EQ(view.text(TextBox::Text2), "2031");

    view.setText(TextBox::Text3, "13");
    EXPECT_FALSE(ValidateYear(view, TextBox::Text3, dialogs, kThisYear));
    EXPECT_EQ(view.text(TextBox::Text3), "2013");
}

TEST_F(WindowChecks, ValidateWeeksWritesTheKeptNumberBack)
{
    view.setText(TextBox::Text4, "250");
    dialogs.expect(MessageRequest::inputProblem(kTooManyWeeks));
    EXPECT_TRUE(ValidateWeeks(view, TextBox::Text4, dialogs));
    EXPECT_EQ(view.text(TextBox::Text4), "100");

    view.setText(TextBox::Text4, "6.5");
    EXPECT_FALSE(ValidateWeeks(view, TextBox::Text4, dialogs));
    EXPECT_EQ(view.text(TextBox::Text4), "6");
}

TEST_F(WindowChecks, ByYearChecksTheByYearPairAndCorrectsItsEndYear)
{
    select(OptionButton::Option1);
    view.setText(TextBox::Text2, "2015");
    view.setText(TextBox::Text7, "1900");
    dialogs.expect(MessageRequest::inputProblem(kStartAfterEnd));
    EXPECT_TRUE(CheckPeriodOptions(view, dialogs));
    EXPECT_EQ(view.text(TextBox::Text3), "2015");
    EXPECT_EQ(view.text(TextBox::Text7), "1900") << "the By Month pair is not the By Year check's business";
}

TEST_F(WindowChecks, ByMonthChecksItsOwnPairAndLeavesTheByYearPairAlone)
{
    select(OptionButton::Option3);
    view.setText(TextBox::Text6, "2013");
    view.setText(TextBox::Text7, "2030");
    view.setText(TextBox::Text2, "2015");
    view.setText(TextBox::Text3, "2013");
    dialogs.expect(MessageRequest::inputProblem(kMonthModeSpan));
    EXPECT_TRUE(CheckPeriodOptions(view, dialogs));
    EXPECT_EQ(view.text(TextBox::Text7), "2013");
    EXPECT_EQ(view.text(TextBox::Text3), "2013");

    // Corrected once, the pair passes.
    EXPECT_FALSE(CheckPeriodOptions(view, dialogs));
}

TEST_F(WindowChecks, ByWeekShowsNothingButRewritesTheByYearEndBox)
{
    select(OptionButton::Option2);
    view.setText(TextBox::Text2, "2099");
    view.setText(TextBox::Text3, "the end");
    EXPECT_FALSE(CheckPeriodOptions(view, dialogs));
    EXPECT_EQ(view.text(TextBox::Text3), "0");
    EXPECT_TRUE(dialogs.log().empty());
}

} // namespace
} // namespace penmoor
