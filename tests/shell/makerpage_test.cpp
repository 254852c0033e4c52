#include "shell/makerpage.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

TEST(MakerPage, OnlyTheSeventhOfAHundredDrawsOpensThePage)
{
    struct Case {
        double r;
        bool opens;
    };
    const std::vector<Case> cases = {
        { 0.0, false },
        { 0.0599999, false },
        { 0.06, true },
        { 0.065, true },
        { 0.0699999, true },
        { 0.07, false },
        { 0.5, false },
        { 0.9999999, false },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(isMakerPageDraw(c.r), c.opens) << c.r;
    }
}

TEST(MakerPage, OpensTheMakersAddressOnceOrNotAtAll)
{
    std::vector<std::string> opened;
    const AddressOpener open = [&](std::string_view address) { opened.emplace_back(address); };

    OpenMakerPage([] { return 0.5; }, open);
    EXPECT_TRUE(opened.empty());

    OpenMakerPage([] { return 0.065; }, open);
    ASSERT_EQ(opened.size(), 1u);
    EXPECT_EQ(opened.front(), "https://www.penmoor.example/");
}

TEST(MakerPage, TheSeededSourceDrawsSpreadNumbersBelowOne)
{
    const UnitRandom random = seededUnitRandom();
    int sevens = 0;
    double smallest = 1, largest = 0;
    for (int i = 0; i < 100000; ++i) {
        const double r = random();
        ASSERT_GE(r, 0.0);
        ASSERT_LT(r, 1.0);
        smallest = std::min(smallest, r);
        largest = std::max(largest, r);
        sevens += isMakerPageDraw(r) ? 1 : 0;
    }
    EXPECT_LT(smallest, 0.01);
    EXPECT_GT(largest, 0.99);
    // About one in a hundred; the bounds are wide enough never to fail by chance.
    EXPECT_GT(sevens, 700);
    EXPECT_LT(sevens, 1300);
}

} // namespace
} // namespace penmoor
