#include "shell/filereplace.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;

std::string readFile(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return { std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>() };
}

void writeFile(const fs::path& path, const std::string& contents)
{
    std::ofstream(path, std::ios::binary) << contents;
}

std::set<std::string> namesIn(const fs::path& folder)
{
    std::set<std::string> names;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
        names.insert(entry.path().filename().string());
    }
    return names;
}

class FileReplaceTest : public ::testing::Test {
protected:
    testing::TemporaryFolder folder;
    const std::vector<std::uint8_t> bytes { 0xD0, 0xCF, 0x11, 0xE0, '\r', '\n', 0x00, 0x1A, 0xFF };
    const std::string asText { "\xD0\xCF\x11\xE0\r\n\0\x1A\xFF", 9 };
};

TEST_F(FileReplaceTest, WritesANewFileOrReplacesAnOldOneLeavingNothingBeside)
{
    const fs::path target = folder / "plan.xls";
    EXPECT_FALSE(replaceFileContents(target, bytes));
    EXPECT_EQ(readFile(target), asText);

    writeFile(target, "an older and much longer plan than the new one");
    EXPECT_FALSE(replaceFileContents(target, bytes));
    EXPECT_EQ(readFile(target), asText);

    EXPECT_FALSE(replaceFileContents(target, {}));
    EXPECT_EQ(readFile(target), "");
    EXPECT_EQ(namesIn(folder.path()), std::set<std::string>({ "plan.xls" }));
}

TEST_F(FileReplaceTest, AFailureLeavesTheTargetAsItWasAndNothingBeside)
{
    const fs::path plans = folder / "plans";
    fs::create_directory(plans);
    writeFile(plans / "inside.txt", "kept");
    const struct {
        fs::path target;
        std::errc reason;
    } cases[] = {
        { folder / "missing" / "plan.xls", std::errc::no_such_file_or_directory },
        { plans, std::errc::is_a_directory },
    };
    for (const auto& c : cases) {
        EXPECT_EQ(replaceFileContents(c.target, bytes), std::make_error_code(c.reason)) << c.target;
    }
    EXPECT_EQ(namesIn(folder.path()), std::set<std::string>({ "plans" }));
    EXPECT_EQ(namesIn(plans), std::set<std::string>({ "inside.txt" }));
    EXPECT_EQ(readFile(plans / "inside.txt"), "kept");
}

TEST_F(FileReplaceTest, AFolderThatMayNotBeWrittenKeepsItsFile)
{
    const fs::path locked = folder / "locked";
    fs::create_directory(locked);
    writeFile(locked / "plan.xls", "last year's plan");
    fs::permissions(locked, fs::perms::owner_read | fs::perms::owner_exec);
    const bool enforced = !std::ofstream(locked / "probe");
    if (!enforced) {
        fs::permissions(locked, fs::perms::owner_all);
        GTEST_SKIP() << "this user may write into read-only folders";
    }

    const std::error_code error = replaceFileContents(locked / "plan.xls", bytes);
    fs::permissions(locked, fs::perms::owner_all);

    EXPECT_EQ(error, std::make_error_code(std::errc::permission_denied));
    EXPECT_EQ(readFile(locked / "plan.xls"), "last year's plan");
    EXPECT_EQ(namesIn(locked), std::set<std::string>({ "plan.xls" }));
}

TEST_F(FileReplaceTest, TheSuccessorKeepsWhoMayReadTheFileItReplaces)
{
#ifdef _WIN32
    GTEST_SKIP() << "Windows files take their folder's access list";
#endif
    const fs::path target = folder / "private.xls";
    writeFile(target, "mine alone");
    const fs::perms ownerOnly = fs::perms::owner_read | fs::perms::owner_write;
    fs::permissions(target, ownerOnly);

    EXPECT_FALSE(replaceFileContents(target, bytes));
    EXPECT_EQ(fs::status(target).permissions(), ownerOnly);
    EXPECT_EQ(readFile(target), asText);
}

} // namespace
} // namespace penmoor
