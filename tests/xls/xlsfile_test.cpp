// Saving and opening files: failures leave nothing behind and say why, and unreadable content is
// named as such. How a complete file replaces the old one is the shell's file replacement tests'.
#include "automation/contract/error.h"
#include "spreadsheet/xls/xlsfile.h"
#include "spreadsheet/xls/xlswriter.h"
#include "tests/xls/support/files.h"
#include "tests/xls/support/sampleworkbooks.h"
#include "tests/xls/support/tempdir.h"
#include "tests/xls/support/workbookcompare.h"

#include <functional>

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

using namespace engine;
using test::folderContents;
using test::readFile;
using test::utf8;
using test::writeFile;

// The xl::Error text of a call, or "" when it succeeds.
std::string failure(const std::function<void()>& call)
{
    try {
        call();
    } catch (const xl::Error& error) {
        return error.what();
    }
    return "";
}

TEST(XlsFile, SavesAndOpensUnderAnyName)
{
    test::TempDir folder;
    const auto path = utf8(folder.file("Überschuss 現金 2013.xls"));
    const Workbook book = test::cashFlowSample();
    saveXlsFile(book, path);
    EXPECT_EQ(folderContents(folder.path()), std::vector<std::string> { "Überschuss 現金 2013.xls" });
    EXPECT_EQ(test::workbookDifferences(book, openXlsFile(path)), "");
    EXPECT_EQ(readFile(folder.file("Überschuss 現金 2013.xls")), writeXls(book));
}

TEST(XlsFile, FailedSavesLeaveNothingBehindAndSayWhy)
{
    test::TempDir folder;
    const Workbook book = test::cashFlowSample();

    const auto missing = utf8(folder.file("no such folder") / "plan.xls");
    EXPECT_EQ(failure([&] { saveXlsFile(book, missing); }),
        "The workbook cannot be saved as \"" + missing + "\": No such file or directory.");

    // A workbook the format cannot hold leaves the existing file as it was.
    const auto kept = folder.file("kept.xls");
    writeFile(kept, "the old workbook");
    Workbook tooLong;
    tooLong.addSheet("S").setContent({ 1, 1 }, std::string(40000, 'x'));
    EXPECT_NE(failure([&] { saveXlsFile(tooLong, utf8(kept)); }).find("A1 is longer than 32767 characters"),
        std::string::npos);
    EXPECT_EQ(readFile(kept), test::bytesOf("the old workbook"));

    EXPECT_EQ(folderContents(folder.path()), std::vector<std::string> { "kept.xls" });
}

TEST(XlsFile, OpenSaysWhyItCannot)
{
    test::TempDir folder;
    const auto missing = utf8(folder.file("missing.xls"));
    EXPECT_EQ(failure([&] { openXlsFile(missing); }),
        "The workbook \"" + missing + "\" cannot be opened: No such file or directory.");

    const auto text = folder.file("notes.xls");
    writeFile(text, std::string(2000, 'n'));
    EXPECT_EQ(failure([&] { openXlsFile(utf8(text)); }),
        utf8(text) + " is not a readable .xls workbook: the file does not start with the compound file signature.");

    const auto cut = folder.file("cut.xls");
    const auto bytes = writeXls(test::cashFlowSample());
    writeFile(cut, std::span(bytes).first(3000));
    EXPECT_NE(failure([&] { openXlsFile(utf8(cut)); }).find(utf8(cut) + " is not a readable .xls workbook: "),
        std::string::npos);
}

} // namespace
} // namespace penmoor::xls
