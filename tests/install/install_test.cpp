#include "tests/support/temporaryfolder.h"

#include <cstdlib>
#include <fstream>
#include <memory>
#include <sstream>
#include <string>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;

std::string contents(const fs::path& path)
{
    std::ifstream in(path);
    std::ostringstream text;
    text << in.rdbuf();
    return text.str();
}

class InstallTest : public ::testing::Test {
protected:
    static void SetUpTestSuite()
    {
        prefix = std::make_unique<testing::TemporaryFolder>();
        const std::string command = std::string("\"") + PENMOOR_CMAKE_COMMAND + "\" --install \"" + PENMOOR_BINARY_DIR
            + "\" --prefix \"" + prefix->path().string() + "\" > \"" + (prefix->path() / "install.log").string()
            + "\" 2>&1";
        installStatus = std::system(command.c_str());
    }
    static void TearDownTestSuite() { prefix.reset(); }

    void SetUp() override { ASSERT_EQ(installStatus, 0) << contents(prefix->path() / "install.log"); }

    static fs::path programFolder() { return prefix->path() / PENMOOR_INSTALL_LIBDIR / "penmoor"; }

    // One installation for all tests, in a prefix of its own.
    static inline std::unique_ptr<testing::TemporaryFolder> prefix;
    static inline int installStatus = -1;
};

TEST_F(InstallTest, BothProgramsLiveInTheirOwnFolderWithTheSplashPicture)
{
    for (const char* program : { "penmoor", "penmoor-build" }) {
        SCOPED_TRACE(program);
        const fs::path installed = programFolder() / program;
        EXPECT_TRUE(fs::is_regular_file(installed));
        EXPECT_NE(fs::status(installed).permissions() & fs::perms::owner_exec, fs::perms::none);
        // The command on the path is a relative link into the program folder, which is where
        // the program looks for its own files.
        const fs::path command = prefix->path() / "bin" / program;
        ASSERT_TRUE(fs::is_symlink(command));
        EXPECT_TRUE(fs::read_symlink(command).is_relative());
        EXPECT_TRUE(fs::equivalent(command, installed));
    }
    EXPECT_TRUE(fs::is_regular_file(programFolder() / "Splash" / "penmoor-splash.png"));
    EXPECT_FALSE(fs::exists(programFolder() / "penmoor-build-tree")) << "an installed program is no development run";
}

TEST_F(InstallTest, TheDesktopEntryAndIconPutPenmoorInTheApplicationMenu)
{
    const std::string entry = contents(prefix->path() / "share" / "applications" / "penmoor.desktop");
    EXPECT_EQ(entry.rfind("[Desktop Entry]\n", 0), 0U);
    for (const char* line : { "\nType=Application\n", "\nName=Penmoor\n", "\nExec=penmoor\n", "\nIcon=penmoor\n",
             "\nTerminal=false\n", "\nCategories=Office;Finance;\n" }) {
        EXPECT_NE(entry.find(line), std::string::npos) << line;
    }
    for (const char* size : { "16x16", "32x32", "48x48", "64x64", "128x128", "256x256" }) {
        EXPECT_TRUE(fs::is_regular_file(prefix->path() / "share" / "icons" / "hicolor" / size / "apps" / "penmoor.png"))
            << size;
    }
}

} // namespace
} // namespace penmoor
