#include "automation/picturefile.h"

#include "shell/utf8path.h"
#include "spreadsheet/picture/bmpfile.h"

#include <cerrno>
#include <cstdint>
#include <cstring>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>
#include <vector>

namespace penmoor {

namespace {

// The two headers of a bitmap file and where their fields sit.
constexpr std::size_t kHeadersSize = 14 + 40;
constexpr std::size_t kPixelOffsetAt = 10;
constexpr std::size_t kInfoSizeAt = 14;
constexpr std::size_t kWidthAt = 18;
constexpr std::size_t kHeightAt = 22;
constexpr std::size_t kPlanesAt = 26;
constexpr std::size_t kBitsPerPixelAt = 28;
constexpr std::size_t kCompressionAt = 30;
constexpr std::uint32_t kInfoHeaderSize = 40;
// The bound of a sheet picture: 32,767 pixels a side, 2^28 pixels in all.
constexpr std::int64_t kMaximumSide = 32767;
constexpr std::int64_t kMaximumPixels = std::int64_t { 1 } << 28;

std::uint32_t read32(const std::vector<std::uint8_t>& bytes, std::size_t at)
{
    return bytes[at] | (bytes[at + 1] << 8) | (bytes[at + 2] << 16) | (std::uint32_t { bytes[at + 3] } << 24);
}

std::uint16_t read16(const std::vector<std::uint8_t>& bytes, std::size_t at)
{
    return static_cast<std::uint16_t>(bytes[at] | (bytes[at + 1] << 8));
}

std::string systemReason()
{
    return std::strerror(errno != 0 ? errno : EIO);
}

std::runtime_error cannotLoad(const std::filesystem::path& path, const std::string& reason)
{
    return std::runtime_error("The sheet picture \"" + utf8Text(path) + "\" cannot be loaded: " + reason + ".");
}

std::vector<std::uint8_t> readWholeFile(const std::filesystem::path& path)
{
    errno = 0;
    std::ifstream in(path, std::ios::binary);
    if (!in) {
        throw cannotLoad(path, systemReason());
    }
    // A read that stops early leaves the file shorter than its headers promise, which the
    // checks of the picture catch.
    return { std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>() };
}

} // namespace

void writePictureFile(const std::filesystem::path& path, const xl::Picture& picture)
{
    const std::vector<std::uint8_t> bytes = picture::encodeBmp(picture);
    errno = 0;
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    if (out) {
        out.write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
        out.close();
    }
    if (!out) {
        throw std::runtime_error(
            "The sheet picture cannot be saved as \"" + utf8Text(path) + "\": " + systemReason() + ".");
    }
}

xl::Picture loadPictureFile(const std::filesystem::path& path)
{
    const std::vector<std::uint8_t> bytes = readWholeFile(path);
    const auto refuse = [&](const char* reason) { return cannotLoad(path, reason); };
    if (bytes.size() < kHeadersSize || bytes[0] != 'B' || bytes[1] != 'M') {
        throw refuse("it is not a bitmap file");
    }
    if (read32(bytes, kInfoSizeAt) != kInfoHeaderSize || read16(bytes, kPlanesAt) != 1
        || read16(bytes, kBitsPerPixelAt) != 24 || read32(bytes, kCompressionAt) != 0) {
        throw refuse("it is not an uncompressed bitmap of 24 bits per pixel");
    }
    const auto width = std::int64_t { static_cast<std::int32_t>(read32(bytes, kWidthAt)) };
    // A positive height: rows stored from the bottom up.
    const auto height = std::int64_t { static_cast<std::int32_t>(read32(bytes, kHeightAt)) };
    if (width <= 0 || height <= 0 || width > kMaximumSide || height > kMaximumSide || width * height > kMaximumPixels) {
        throw refuse("its size is not that of a sheet picture");
    }
    const std::int64_t rowBytes = (width * 3 + 3) / 4 * 4;
    const std::uint64_t pixelOffset = read32(bytes, kPixelOffsetAt);
    if (pixelOffset < kHeadersSize || pixelOffset + static_cast<std::uint64_t>(rowBytes * height) > bytes.size()) {
        throw refuse("the file is shorter than its picture");
    }

    xl::Picture picture;
    picture.width = static_cast<int>(width);
    picture.height = static_cast<int>(height);
    picture.pixels.resize(static_cast<std::size_t>(width * height));
    for (std::int64_t row = 0; row < height; ++row) {
        const std::uint8_t* source = bytes.data() + pixelOffset + (height - 1 - row) * rowBytes;
        std::uint32_t* target = picture.pixels.data() + row * width;
        for (std::int64_t x = 0; x < width; ++x, source += 3) {
            target[x]
                = 0xFF000000u | (std::uint32_t { source[2] } << 16) | (std::uint32_t { source[1] } << 8) | source[0];
        }
    }
    return picture;
}

} // namespace penmoor
