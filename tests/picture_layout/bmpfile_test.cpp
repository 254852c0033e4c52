#include "automation/contract/error.h"
#include "spreadsheet/picture/bmpfile.h"

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

std::uint32_t read32(const std::vector<std::uint8_t>& bytes, std::size_t at)
{
    return bytes[at] | (bytes[at + 1] << 8) | (bytes[at + 2] << 16) | (static_cast<std::uint32_t>(bytes[at + 3]) << 24);
}

TEST(BmpFileTest, HeaderRowsBottomUpAndPadding)
{
    // 2 x 2: red, green over blue, white. Rows of 6 bytes are padded to 8.
    const xl::Picture picture { 2, 2, { 0xFFFF0000, 0xFF00FF00, 0xFF0000FF, 0xFFFFFFFF } };
    const std::vector<std::uint8_t> bytes = encodeBmp(picture);
    ASSERT_EQ(bytes.size(), 54u + 16u);
    EXPECT_EQ(bytes[0], 'B');
    EXPECT_EQ(bytes[1], 'M');
    EXPECT_EQ(read32(bytes, 2), bytes.size());
    EXPECT_EQ(read32(bytes, 10), 54u);
    EXPECT_EQ(read32(bytes, 18), 2u);
    EXPECT_EQ(read32(bytes, 22), 2u);
    EXPECT_EQ(bytes[28], 24);
    // The first stored row is the bottom one: blue then white, as blue-green-red triples.
    const std::vector<std::uint8_t> bottom(bytes.begin() + 54, bytes.begin() + 62);
    EXPECT_EQ(bottom, (std::vector<std::uint8_t> { 0xFF, 0, 0, 0xFF, 0xFF, 0xFF, 0, 0 }));
    const std::vector<std::uint8_t> top(bytes.begin() + 62, bytes.end());
    EXPECT_EQ(top, (std::vector<std::uint8_t> { 0, 0, 0xFF, 0, 0xFF, 0, 0, 0 }));
}

TEST(BmpFileTest, EmptyOrInconsistentPicturesAreRefused)
{
    EXPECT_THROW(encodeBmp(xl::Picture {}), xl::Error);
    EXPECT_THROW(encodeBmp(xl::Picture { 3, 3, { 0 } }), xl::Error);
}

} // namespace
} // namespace penmoor::picture
