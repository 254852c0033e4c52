#include "model/storedvalue.h"

#include <gtest/gtest.h>

namespace penmoor {
namespace {

TEST(StoredBoolean, AcceptsBooleanTextsAndNumbersOnly)
{
    const struct {
        const char* text;
        bool fallback;
        bool expected;
    } cases[] = {
        { "True", false, true },
        { "False", true, false },
        { "tRUE", false, true },
        { "FALSE", true, false },
        { " True ", false, true },
        { "1", false, true },
        { "0", true, false },
        { "-1", false, true },
        { "0.0", true, false },
        { "2.5", false, true },
        { " 0 ", true, false },
        { "", true, true },
        { "", false, false },
        { "yes", true, true },
        { "Truex", false, false },
        { "1x", false, false },
        { "1x", true, true },
        { "+", false, false },
        { "T", true, true },
    };
    for (const auto& c : cases) {
        EXPECT_EQ(readStoredBoolean(c.text, c.fallback), c.expected)
            << '"' << c.text << "\" with fallback " << c.fallback;
    }
    EXPECT_EQ(booleanText(true), "True");
    EXPECT_EQ(booleanText(false), "False");
}

TEST(StoredCount, AcceptsWholeNumbersInRange)
{
    const struct {
        const char* text;
        std::optional<int> expected;
    } cases[] = {
        { "44", 44 },
        { " 44 ", 44 },
        { "44.0", 44 },
        { "+44", 44 },
        { "1", 1 },
        { "32768", 32768 },
        { "32769", std::nullopt },
        { "0", std::nullopt },
        { "-3", std::nullopt },
        { "44.5", std::nullopt },
        { "", std::nullopt },
        { "abc", std::nullopt },
        { "44abc", std::nullopt },
        { "1e3", std::nullopt },
        { "99999999999999999999", std::nullopt },
    };
    for (const auto& c : cases) {
        EXPECT_EQ(readStoredCount(c.text, 32768), c.expected) << '"' << c.text << '"';
    }
}

} // namespace
} // namespace penmoor
