#include "shell/developmentrun.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

TEST(IsInIDE, FollowsTheVariableFirstAndTheBuildTreeMarkerOtherwise)
{
    testing::TemporaryFolder built;
    testing::TemporaryFolder installed;
    std::ofstream(built / std::string(kBuildTreeMarker)) << "";

    struct Case {
        const testing::TemporaryFolder& folder;
        const char* variable;
        bool inIde;
    };
    const std::vector<Case> cases = {
        { installed, nullptr, false },
        { built, nullptr, true },
        { installed, "1", true },
        { built, "0", false },
        { installed, "", false },
        { built, "", true },
        { installed, "yes", false },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(IsInIDE(c.folder.path(), c.variable), c.inIde)
            << c.folder.path() << " with " << (c.variable ? c.variable : "(unset)");
    }
}

} // namespace
} // namespace penmoor
