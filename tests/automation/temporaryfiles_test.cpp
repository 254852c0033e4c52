#include "automation/privatefolder.h"
#include "automation/temporaryworkbook.h"
#include "shell/newentry.h"
#include "tests/automation/scriptedrandom.h"
#include "tests/support/temporaryfolder.h"

#include <algorithm>
#include <fstream>
#include <set>
#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::drawsForDigits;
using testing::scriptedRandom;
using testing::TemporaryFolder;

void writeText(const fs::path& path, const std::string& text)
{
    std::ofstream(path, std::ios::binary) << text;
}

std::string readText(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return { std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>() };
}

TEST(TemporaryWorkbookName, MapsEachDrawToADigitFromOneToNine)
{
    struct Case {
        double draw;
        char digit;
    };
    const Case cases[] = {
        { 0.0, '1' },
        { 1.0 / 9.0 - 1e-12, '1' },
        { 1.0 / 9.0, '2' },
        { 0.9999999999999999, '9' },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(temporaryWorkbookName(scriptedRandom({ c.draw })), "qarnet" + std::string(8, c.digit) + ".xls")
            << c.draw;
    }
    EXPECT_EQ(temporaryWorkbookName(scriptedRandom(drawsForDigits("12345678"))), "qarnet12345678.xls");
}

TEST(TemporaryWorkbookName, FromTheSeededGeneratorKeepsItsForm)
{
    const UnitRandom random = seededUnitRandom();
    // "qarnet", eight digits 1 to 9, ".xls".
    const auto hasTheForm = [](const std::string& name) {
        return name.size() == 18 && name.rfind("qarnet", 0) == 0 && name.compare(14, 4, ".xls") == 0
            && std::all_of(name.begin() + 6, name.begin() + 14, [](char c) { return c >= '1' && c <= '9'; });
    };
    std::set<std::string> names;
    for (int i = 0; i < 200; ++i) {
        const std::string name = temporaryWorkbookName(random);
        EXPECT_TRUE(hasTheForm(name)) << name;
        names.insert(name);
    }
    // Seeded once rather than from the clock for each digit, so the names differ.
    EXPECT_GT(names.size(), 190u);
}

TEST(ClaimTemporaryWorkbook, CreatesAnEmptyFileUnderTheDrawnName)
{
    TemporaryFolder folder;
    const fs::path claimed = claimTemporaryWorkbook(folder.path(), scriptedRandom(drawsForDigits("98765432")));
    EXPECT_EQ(claimed, folder / "qarnet98765432.xls");
    ASSERT_TRUE(fs::is_regular_file(claimed));
    EXPECT_EQ(fs::file_size(claimed), 0u);
}

TEST(ClaimTemporaryWorkbook, DrawsANewNameAtOnceWhenTheNameIsTaken)
{
    TemporaryFolder folder;
    writeText(folder / "qarnet11111111.xls", "the user's own file");
    fs::create_directory(folder / "qarnet22222222.xls");
#ifndef _WIN32
    // A link planted under the name must not be followed, not even a dangling one.
    fs::create_symlink(folder / "elsewhere.xls", folder / "qarnet33333333.xls");
#endif
    std::vector<double> draws;
    for (const char* digits : { "11111111", "22222222", "33333333", "44444444" }) {
        const std::vector<double> d = drawsForDigits(digits);
        draws.insert(draws.end(), d.begin(), d.end());
    }
    const fs::path claimed = claimTemporaryWorkbook(folder.path(), scriptedRandom(draws));
#ifdef _WIN32
    EXPECT_EQ(claimed, folder / "qarnet33333333.xls");
#else
    EXPECT_EQ(claimed, folder / "qarnet44444444.xls");
    EXPECT_FALSE(fs::exists(folder / "elsewhere.xls"));
#endif
    EXPECT_EQ(readText(folder / "qarnet11111111.xls"), "the user's own file");
}

TEST(ClaimTemporaryWorkbook, FailsWithTheFolderNamedInsteadOfSpinning)
{
    TemporaryFolder folder;
    const fs::path missing = folder / "no such folder";
    try {
        claimTemporaryWorkbook(missing, scriptedRandom({ 0.5 }));
        FAIL() << "a missing folder must fail";
    } catch (const std::runtime_error& e) {
        EXPECT_NE(
            std::string(e.what()).find("Could not create the temporary workbook in \"" + missing.string() + "\": "),
            std::string::npos)
            << e.what();
    }
    // A source that draws the same taken name for ever ends in an error, not a hang.
    writeText(folder / "qarnet55555555.xls", "");
    EXPECT_THROW(claimTemporaryWorkbook(folder.path(), scriptedRandom({ 0.5 })), std::runtime_error);
}

TEST(PrivateFolder, IsTheUsersOwnUnderAFreeNameAndGoesWithItsContents)
{
    TemporaryFolder parent;
    fs::create_directory(parent / "penmoor-111111111111");
    writeText(parent / "penmoor-111111111111" / "keep", "someone else's");
    std::vector<double> draws(12, 0.1);
    draws.insert(draws.end(), 12, 0.2);
    fs::path made;
    {
        PrivateFolder folder(parent.path(), scriptedRandom(draws));
        made = folder.path();
        EXPECT_EQ(made, parent / "penmoor-222222222222");
        ASSERT_TRUE(fs::is_directory(made));
#ifndef _WIN32
        EXPECT_EQ(fs::status(made).permissions(), fs::perms::owner_all);
#endif
        writeText(made / "temp.bmp", "picture");
    }
    EXPECT_FALSE(fs::exists(made));
    EXPECT_EQ(readText(parent / "penmoor-111111111111" / "keep"), "someone else's");
    EXPECT_THROW(PrivateFolder(parent / "missing", scriptedRandom({ 0.5 })), std::runtime_error);
}

} // namespace
} // namespace penmoor
