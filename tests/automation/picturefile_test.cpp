#include "automation/picturefile.h"
#include "tests/support/temporaryfolder.h"

#include <cstdint>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::TemporaryFolder;

std::vector<std::uint8_t> readBytes(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return { std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>() };
}

void writeBytes(const fs::path& path, const std::vector<std::uint8_t>& bytes)
{
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
}

void put32(std::vector<std::uint8_t>& bytes, std::size_t at, std::uint32_t value)
{
    for (int i = 0; i < 4; ++i) {
        bytes[at + static_cast<std::size_t>(i)] = static_cast<std::uint8_t>(value >> (8 * i));
    }
}

// 3 x 2 pixels, so that each stored row carries padding; opaque, as a bitmap gives them back.
const xl::Picture kPicture { 3, 2, { 0xFFFF0000, 0xFF00FF00, 0xFF0000FF, 0xFF123456, 0xFFFFFFFF, 0xFF000000 } };

TEST(PictureFile, GivesBackThePictureItWrote)
{
    TemporaryFolder folder;
    writePictureFile(folder / "temp.bmp", kPicture);
    const xl::Picture loaded = loadPictureFile(folder / "temp.bmp");
    EXPECT_EQ(loaded.width, kPicture.width);
    EXPECT_EQ(loaded.height, kPicture.height);
    EXPECT_EQ(loaded.pixels, kPicture.pixels);
}

TEST(PictureFile, RefusesWhatIsNoPictureOfOurs)
{
    TemporaryFolder folder;
    writePictureFile(folder / "good.bmp", kPicture);
    const std::vector<std::uint8_t> good = readBytes(folder / "good.bmp");

    struct Case {
        const char* name;
        std::vector<std::uint8_t> bytes;
        const char* reason;
    };
    std::vector<Case> cases;
    cases.push_back({ "empty", {}, "it is not a bitmap file" });
    auto truncated = good;
    truncated.resize(good.size() - 1);
    cases.push_back({ "truncated", truncated, "the file is shorter than its picture" });
    auto deep = good;
    deep[28] = 32;
    cases.push_back({ "32 bits", deep, "it is not an uncompressed bitmap of 24 bits per pixel" });
    // Stored top-down (negative height) or beyond what a sheet picture can be.
    auto topDown = good;
    put32(topDown, 22, static_cast<std::uint32_t>(-2));
    cases.push_back({ "top-down", topDown, "its size is not that of a sheet picture" });
    auto huge = good;
    put32(huge, 18, 30000);
    put32(huge, 22, 30000);
    cases.push_back({ "beyond the picture bound", huge, "its size is not that of a sheet picture" });
    auto misplaced = good;
    put32(misplaced, 10, 0xFFFFFFF0u);
    cases.push_back({ "pixels beyond the end", misplaced, "the file is shorter than its picture" });

    for (const Case& c : cases) {
        const fs::path file = folder / "bad.bmp";
        writeBytes(file, c.bytes);
        try {
            loadPictureFile(file);
            ADD_FAILURE() << c.name << " was loaded";
        } catch (const std::runtime_error& e) {
            EXPECT_EQ(std::string(e.what()),
                "The sheet picture \"" + file.string() + "\" cannot be loaded: " + c.reason + ".")
                << c.name;
        }
    }
    try {
        loadPictureFile(folder / "missing.bmp");
        ADD_FAILURE() << "a missing file was loaded";
    } catch (const std::runtime_error& e) {
        EXPECT_NE(std::string(e.what()).find("No such file or directory"), std::string::npos) << e.what();
    }
}

TEST(PictureFile, WritingIntoAMissingFolderFailsWithTheSystemsReason)
{
    TemporaryFolder folder;
    try {
        writePictureFile(folder / "missing" / "temp.bmp", kPicture);
        FAIL() << "nothing can be written there";
    } catch (const std::runtime_error& e) {
        EXPECT_NE(std::string(e.what()).find("No such file or directory"), std::string::npos) << e.what();
    }
}

} // namespace
} // namespace penmoor
