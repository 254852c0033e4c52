#include "model/numbertext.h"

#include <cmath>
#include <limits>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

TEST(NumericValue, ReadsTheLeadingNumber)
{
    const struct {
        const char* text;
        double expected;
    } cases[] = {
        { "2013", 2013 },
        { "2013abc", 2013 },
        { "", 0 },
        { "abc", 0 },
        { "  42", 42 },
        { "20 13", 2013 },
        { "-12.5x", -12.5 },
        { "- 1 2.5", -12.5 },
        { "+7", 7 },
        { ".5", 0.5 },
        { "5.", 5 },
        { "1.2.3", 1.2 },
        { "--5", 0 },
        { "5-3", 5 },
        { "-", 0 },
        { ".", 0 },
        { "1e3", 1 },
        { "0x1F", 0 },
        { "\t\n7", 7 },
        { "6.5", 6.5 },
        { "0.0000000000000000000001", 1e-22 },
    };
    for (const auto& c : cases) {
        EXPECT_DOUBLE_EQ(numericValue(c.text), c.expected) << '"' << c.text << '"';
    }
}

TEST(NumericValue, SaturatesOnWildInput)
{
    const std::string huge(400, '9');
    EXPECT_EQ(numericValue(huge), std::numeric_limits<double>::max());
    EXPECT_EQ(numericValue("-" + huge), -std::numeric_limits<double>::max());
    EXPECT_EQ(numericValue("0." + std::string(400, '0') + "1"), 0.0);
    EXPECT_EQ(numericValue(std::string(100000, '0') + "12"), 12.0);
}

TEST(RoundHalfToEven, RoundsHalvesToTheEvenNeighbourAndSaturates)
{
    const struct {
        double value;
        std::int32_t expected;
    } cases[] = {
        { 5.5, 6 },
        { 6.5, 6 },
        { 0.5, 0 },
        { 1.5, 2 },
        { -0.5, 0 },
        { -2.5, -2 },
        { -3.5, -4 },
        { 2.4999, 2 },
        { 2.5001, 3 },
        { -2.6, -3 },
        { 2013, 2013 },
        { 99999999999.0, std::numeric_limits<std::int32_t>::max() },
        { -99999999999.0, std::numeric_limits<std::int32_t>::min() },
        { 2147483647.5, std::numeric_limits<std::int32_t>::max() },
        { 2147483646.5, 2147483646 },
        { -2147483648.5, std::numeric_limits<std::int32_t>::min() },
        { std::numeric_limits<double>::infinity(), std::numeric_limits<std::int32_t>::max() },
        { -std::numeric_limits<double>::infinity(), std::numeric_limits<std::int32_t>::min() },
        { std::nan(""), 0 },
    };
    for (const auto& c : cases) {
        EXPECT_EQ(roundHalfToEven(c.value), c.expected) << c.value;
    }
}

TEST(NumberText, WritesIntegralValuesWithoutAPoint)
{
    const struct {
        double value;
        const char* expected;
    } cases[] = {
        { 2013, "2013" },
        { 2013.5, "2013.5" },
        { 0, "0" },
        { -0.0, "0" },
        { -12, "-12" },
        { 0.1 + 0.2, "0.3" },
        { 1e20, "1e+20" },
        { 123456789012345, "123456789012345" },
        { 1.0 / 3, "0.333333333333333" },
    };
    for (const auto& c : cases) {
        EXPECT_EQ(numberText(c.value), c.expected) << c.value;
    }
}

} // namespace
} // namespace penmoor
