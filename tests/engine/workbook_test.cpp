#include "automation/contract/error.h"
#include "spreadsheet/workbook/workbook.h"

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

std::string failure(const std::function<void()>& action)
{
    try {
        action();
    } catch (const xl::Error& error) {
        return error.what();
    }
    return "no error";
}

TEST(Workbook, StartsWithThreeSheetsAndTheDesktopPalette)
{
    Workbook workbook = Workbook::withDefaultSheets();
    ASSERT_EQ(workbook.sheetCount(), 3);
    EXPECT_EQ(workbook.sheet(2).name(), "Sheet3");
    EXPECT_EQ(workbook.activeSheetIndex(), 0);
    EXPECT_EQ(workbook.color(1), 0u);
    EXPECT_EQ(workbook.color(2), 0xFFFFFFu);
    EXPECT_EQ(workbook.color(3), 255u); // red
    EXPECT_EQ(workbook.color(16), 128u + 256u * 128u + 65536u * 128u);
    EXPECT_EQ(workbook.color(56), 51u + 256u * 51u + 65536u * 51u);
    EXPECT_EQ(workbook.styles().style(kDefaultStyleId), CellStyle {});
}

TEST(Workbook, PaletteEntriesAreCheckedAndKept)
{
    Workbook workbook;
    workbook.setColor(12, 0x5F5237);
    EXPECT_EQ(workbook.color(12), 0x5F5237u);
    EXPECT_EQ(failure([&] { workbook.color(57); }), "The colour index 57 is outside the palette (1 to 56).");
    EXPECT_EQ(failure([&] { workbook.setColor(0, 1); }), "The colour index 0 is outside the palette (1 to 56).");
    EXPECT_NE(failure([&] { workbook.setColor(1, 0x1000000); }), "no error");
}

TEST(Workbook, SheetNamesFollowTheApplicationsRules)
{
    Workbook workbook = Workbook::withDefaultSheets();
    const struct {
        std::string name;
        const char* problem; // a part of the message, or nullptr when the name is accepted
    } cases[] = {
        { "CashFlow", nullptr },
        { std::string(31, 'x'), nullptr },
        { "Ünïcödé €", nullptr },
        { "It's fine", nullptr },
        { "", "cannot be empty" },
        { std::string(32, 'x'), "longer than 31 characters" },
        { "a:b", "cannot contain" },
        { "a\\b", "cannot contain" },
        { "a/b", "cannot contain" },
        { "a?b", "cannot contain" },
        { "a*b", "cannot contain" },
        { "[a", "cannot contain" },
        { "a]", "cannot contain" },
        { "tab\there", "cannot contain" },
        { "'quoted", "apostrophe" },
        { "quoted'", "apostrophe" },
        { "sheet2", "already exists" },
        { "\xC3\x28", "not valid UTF-8" },
    };
    for (const auto& c : cases) {
        const std::string message = failure([&] { workbook.renameSheet(0, c.name); });
        if (c.problem)
            EXPECT_NE(message.find(c.problem), std::string::npos) << c.name << ": " << message;
        else
            EXPECT_EQ(message, "no error") << c.name;
    }
    // A sheet may take its own name in another letter case.
    workbook.renameSheet(1, "SHEET2");
    EXPECT_EQ(workbook.sheet(1).name(), "SHEET2");
}

TEST(Workbook, RemovingSheetsKeepsOneAndMovesTheActiveSheet)
{
    Workbook workbook = Workbook::withDefaultSheets();
    const std::uint64_t thirdId = workbook.sheet(2).id();
    workbook.setActiveSheet(1);
    workbook.removeSheet(1);
    EXPECT_EQ(workbook.activeSheetIndex(), 1);
    EXPECT_EQ(workbook.sheet(1).id(), thirdId);
    workbook.removeSheet(1);
    EXPECT_EQ(workbook.activeSheetIndex(), 0);
    EXPECT_EQ(workbook.sheetIndex(thirdId), -1);
    EXPECT_EQ(failure([&] { workbook.removeSheet(0); }),
        "The sheet \"Sheet1\" cannot be deleted: a workbook must keep at least one sheet.");
    // Ids are never handed out twice.
    EXPECT_NE(workbook.addSheet("Sheet2").id(), thirdId);
}

} // namespace
} // namespace penmoor::engine
