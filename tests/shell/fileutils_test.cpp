#include "shell/fileutils.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;

class FileUtilsTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        fs::create_directories(folder / "sub");
        write(folder / "book.xls");
    }

    static void write(const fs::path& path) { std::ofstream(path) << "data"; }

    testing::TemporaryFolder temporary;
    const fs::path folder = temporary.path();
};

TEST_F(FileUtilsTest, FileExistsOnlyForReadableFiles)
{
    fs::create_symlink(folder / "book.xls", folder / "link.xls");
    fs::create_symlink(folder / "gone.xls", folder / "dangling.xls");
    const std::string withNul = (folder / "book.xls").string() + std::string(1, '\0') + "x";

    struct Case {
        fs::path path;
        bool exists;
    };
    const std::vector<Case> cases = {
        { folder / "book.xls", true },
        { folder / "link.xls", true },
        { fs::path(), false },
        { folder / "missing.xls", false },
        { folder / "no-such-folder" / "book.xls", false },
        { folder / "book.xls" / "inside", false },
        { folder / "sub", false },
        { folder / "dangling.xls", false },
        { fs::path(withNul), false },
        { folder / "book.xls" / "", false },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(FileExists(c.path), c.exists) << c.path;
    }
}

TEST_F(FileUtilsTest, DeleteFileRemovesFilesAndIgnoresEverythingElse)
{
    fs::create_symlink(folder / "book.xls", folder / "link.xls");
    write(folder / "other.xls");

    DeleteFile(folder / "link.xls");
    EXPECT_FALSE(fs::exists(fs::symlink_status(folder / "link.xls")));
    EXPECT_TRUE(fs::exists(folder / "book.xls")) << "deleting a link keeps its target";

    DeleteFile(folder / "other.xls");
    EXPECT_FALSE(fs::exists(folder / "other.xls"));

    // None of these may throw, delete anything or remove a folder.
    DeleteFile(folder / "missing.xls");
    DeleteFile(folder / "no-such-folder" / "book.xls");
    DeleteFile(fs::path());
    DeleteFile(fs::path((folder / "book.xls").string() + std::string(1, '\0')));
    DeleteFile(folder / "sub");
    EXPECT_TRUE(fs::is_directory(folder / "sub"));
    EXPECT_TRUE(fs::exists(folder / "book.xls"));
}

TEST_F(FileUtilsTest, Utf8PathsNameTheSameFileAsTheirText)
{
    const fs::path path = folder / pathFromUtf8("Zahlungsfluß 2013 – März.xls");
    write(path);
    EXPECT_TRUE(FileExists(path));
    EXPECT_TRUE(path.filename().u8string() == u8"Zahlungsfluß 2013 – März.xls");
    DeleteFile(path);
    EXPECT_FALSE(FileExists(path));
}

} // namespace
} // namespace penmoor
