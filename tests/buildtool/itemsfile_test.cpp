#include "app/buildtool/buildrequest.h"
#include "app/buildtool/itemsfile.h"
#include "model/defaultlist.h"

#include <gtest/gtest.h>

namespace penmoor {
namespace {

std::vector<std::string> defaultNames()
{
    return { kDefaultItemNames.begin(), kDefaultItemNames.end() };
}

std::string joined(const std::vector<std::string>& names, const std::string& lineEnd = "\n")
{
    std::string text;
    for (const std::string& name : names) {
        text += name + lineEnd;
    }
    return text;
}

std::string refusal(const std::string& content)
{
    try {
        parseItemList(content);
    } catch (const UsageError& problem) {
        return problem.what();
    }
    return "(accepted)";
}

TEST(ItemList, TakesEachLineExactlyAsItStands)
{
    std::vector<std::string> names = defaultNames();
    names.insert(names.begin() + 4, "  Grants, leading blanks kept");
    names.insert(names.begin() + 5, "Trailing blank \t");
    names.insert(names.begin() + 6, "Miete & Nebenkosten (€)");
    names.insert(names.begin() + 7, "=1+1");

    EXPECT_EQ(parseItemList(joined(names)), names);
    // Without the final line break, with CR LF, or after a byte order mark: the same list.
    const std::string withoutFinalBreak = joined(names).substr(0, joined(names).size() - 1);
    EXPECT_EQ(parseItemList(withoutFinalBreak), names);
    EXPECT_EQ(parseItemList(joined(names, "\r\n")), names);
    EXPECT_EQ(parseItemList("\xEF\xBB\xBF" + joined(names)), names);
}

TEST(ItemList, RefusesNamesTheMainWindowWouldNotHold)
{
    const std::vector<std::string> base = defaultNames();
    const auto with = [&](std::size_t at, const std::string& name) {
        std::vector<std::string> names = base;
        names.insert(names.begin() + static_cast<std::ptrdiff_t>(at), name);
        return joined(names);
    };
    struct Case {
        std::string content;
        std::string problem;
    };
    const Case cases[] = {
        { with(3, "Bad \xFF byte"), "line 4: the text is not UTF-8." },
        { with(3, "Tab\tis fine but \x01 is not"), "line 4: the name holds a control character." },
        { with(3, "Lone\rreturn"), "line 4: the name holds a control character." },
        { with(3, ""), "line 4: the name is empty or blank." },
        { with(3, "   "), "line 4: the name is empty or blank." },
        { with(3, "ab"), "line 4: the name \"ab\" is shorter than 3 characters." },
        { with(3, std::string(32768, 'x')), "line 4: the name is longer than a cell can hold." },
        { with(20, "Rent"), "line 21: the name \"Rent\" matches \"Rent\" on line 20." },
        // Names match with the first "&" of each removed.
        { with(44, "Repairs  maintenance"),
            "line 45: the name \"Repairs  maintenance\" matches \"Repairs & maintenance\" on line 16." },
        { joined(base) + "\n", "line 45: the name is empty or blank." },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(refusal(c.content), c.problem) << c.problem;
    }
    // Three characters, counting a leading blank, are enough.
    EXPECT_EQ(parseItemList(with(3, " ab")).at(3), " ab");
}

TEST(ItemList, NeedsTheSystemRowsExactlyAndInTheirOrder)
{
    std::vector<std::string> withoutSubtotal = defaultNames();
    withoutSubtotal.erase(withoutSubtotal.begin() + 29);
    EXPECT_EQ(
        refusal(joined(withoutSubtotal)), "the system row \"SUBTOTAL\" is missing; it must be written exactly so.");

    std::vector<std::string> renamed = defaultNames();
    renamed[29] = "Subtotal";
    EXPECT_EQ(refusal(joined(renamed)), "the system row \"SUBTOTAL\" is missing; it must be written exactly so.");

    std::vector<std::string> swapped = defaultNames();
    std::swap(swapped[29], swapped[35]); // SUBTOTAL and TOTAL CASH PAID OUT
    EXPECT_EQ(refusal(joined(swapped)),
        "line 30: the system row \"TOTAL CASH PAID OUT\" must come after \"SUBTOTAL\" (line 36).");

    // The system rows alone make a list.
    const std::vector<std::string> systemOnly = { "Cash on Hand (beginning of month)", "Cash Sales",
        "TOTAL CASH RECEIPTS", "Total Cash Available (before cash out)", "Purchases (merchandise)", "SUBTOTAL",
        "TOTAL CASH PAID OUT", "Cash Position (end of month)" };
    EXPECT_EQ(parseItemList(joined(systemOnly)), systemOnly);
}

TEST(ItemList, HoldsAtMostTheLargestListTheWindowShows)
{
    std::vector<std::string> names = defaultNames();
    for (int i = static_cast<int>(names.size()); i < kMaximumItemCount; ++i) {
        names.push_back("Expense line " + std::to_string(i));
    }
    EXPECT_EQ(parseItemList(joined(names)).size(), static_cast<std::size_t>(kMaximumItemCount));
    names.push_back("One line too many");
    EXPECT_EQ(refusal(joined(names)), "there are 32769 names; the list holds at most 32768.");
}

} // namespace
} // namespace penmoor
