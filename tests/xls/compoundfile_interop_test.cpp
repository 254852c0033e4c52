// The compound file read by someone else: Debian's python3-olefile lists exactly the streams we
// wrote, with their sizes, and reads their bytes back.
#include "spreadsheet/xls/compoundfilewriter.h"
#include "tests/xls/support/cfbtestfiles.h"
#include "tests/xls/support/files.h"
#include "tests/xls/support/readers.h"
#include "tests/xls/support/tempdir.h"

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

TEST(CompoundFileInterop, OlefileListsTheStreamsWithTheirSizes)
{
    PENMOOR_NEED_READER(test::hasPythonModule("olefile"), "python3-olefile");
    test::TempDir folder;
    // Sizes at the mini stream cutoff and the sector edges, then one past the DIFAT boundary.
    const std::vector<std::vector<std::size_t>> layouts {
        { 0, 1, 4095, 4096, 4097 },
        { 512, 513, 64, 100000 },
        { (109 * 128 - 109 - 1) * 512 + 1, 10 },
    };
    for (std::size_t l = 0; l < layouts.size(); ++l) {
        std::vector<std::vector<std::uint8_t>> data;
        std::vector<CompoundStream> streams;
        std::vector<std::string> expected;
        for (std::size_t i = 0; i < layouts[l].size(); ++i)
            data.push_back(test::patternBytes(layouts[l][i], static_cast<int>(i)));
        for (std::size_t i = 0; i < layouts[l].size(); ++i) {
            const std::string name = "Stream" + std::to_string(i);
            streams.push_back({ std::u16string(name.begin(), name.end()), data[i] });
            expected.push_back(name + " " + std::to_string(layouts[l][i]));
        }
        const auto path = folder.file("layout" + std::to_string(l) + ".cfb");
        test::writeFile(path, writeCompoundFile(streams));
        EXPECT_EQ(test::lines(test::runPythonScript("olefile_list.py", { path.string() })), expected) << "layout " << l;
    }
}

} // namespace
} // namespace penmoor::xls
