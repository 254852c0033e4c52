#include "shell/splashrules.h"
#include "tests/support/memorysettings.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>
#include <optional>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;

TEST(SplashRules, ShowsOnlyWhenTheStoredNumberIsZero)
{
    struct Case {
        std::optional<std::string> stored;
        bool shown;
    };
    const std::vector<Case> cases = {
        { std::nullopt, true },
        { "0", true },
        { "1", false },
        { " 1 ", false },
        { "2", false },
        { "-1", false },
        { "0.0", true },
        { "", true },
        { "abc", true },
        { "1abc", true },
        { "nan", true },
    };
    for (const Case& c : cases) {
        testing::MemorySettings settings;
        if (c.stored) {
            settings.values["ShowAgain"] = *c.stored;
        }
        EXPECT_EQ(isSplashWanted(settings), c.shown) << c.stored.value_or("(absent)");
    }
}

TEST(SplashRules, PicksTheFirstVisibleFileOfTheSplashFolderByName)
{
    testing::TemporaryFolder program;
    EXPECT_EQ(splashPicturePath(program.path()), fs::path()) << "no Splash folder";

    const fs::path splash = program / "Splash";
    fs::create_directory(splash);
    EXPECT_EQ(splashPicturePath(program.path()), fs::path()) << "empty Splash folder";

    fs::create_directory(splash / "0-folder");
    std::ofstream(splash / ".hidden") << "";
    EXPECT_EQ(splashPicturePath(program.path()), fs::path()) << "only a folder and a hidden file";

    std::ofstream(splash / "b.png") << "";
    std::ofstream(splash / "a.jpg") << "";
    std::ofstream(splash / "c.bmp") << "";
    EXPECT_EQ(splashPicturePath(program.path()), splash / "a.jpg");
}

} // namespace
} // namespace penmoor
