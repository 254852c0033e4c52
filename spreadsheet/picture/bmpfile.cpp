#include "spreadsheet/picture/bmpfile.h"

#include "automation/contract/error.h"

namespace penmoor::picture {

namespace {

constexpr std::uint32_t kFileHeaderSize = 14;
constexpr std::uint32_t kInfoHeaderSize = 40;
constexpr std::int32_t kPixelsPerMetre = 3780; // 96 dots per inch

void put16(std::vector<std::uint8_t>& out, std::uint16_t value)
{
    out.push_back(static_cast<std::uint8_t>(value & 0xFF));
    out.push_back(static_cast<std::uint8_t>(value >> 8));
}

void put32(std::vector<std::uint8_t>& out, std::uint32_t value)
{
    for (int shift = 0; shift < 32; shift += 8) {
        out.push_back(static_cast<std::uint8_t>((value >> shift) & 0xFF));
    }
}

} // namespace

std::vector<std::uint8_t> encodeBmp(const xl::Picture& picture)
{
    if (picture.isNull()
        || picture.pixels.size()
            != static_cast<std::size_t>(picture.width) * static_cast<std::size_t>(picture.height)) {
        throw xl::Error("The sheet picture is empty, so no bitmap file can be written.");
    }
    const auto width = static_cast<std::uint64_t>(picture.width);
    const auto height = static_cast<std::uint64_t>(picture.height);
    const std::uint64_t rowBytes = (width * 3 + 3) / 4 * 4;
    const std::uint64_t imageBytes = rowBytes * height;
    const std::uint64_t fileBytes = kFileHeaderSize + kInfoHeaderSize + imageBytes;
    if (fileBytes > 0xFFFFFFFFu) {
        throw xl::Error("The sheet picture is too large for a bitmap file.");
    }

    std::vector<std::uint8_t> out;
    out.reserve(static_cast<std::size_t>(fileBytes));
    out.push_back('B');
    out.push_back('M');
    put32(out, static_cast<std::uint32_t>(fileBytes));
    put32(out, 0); // reserved
    put32(out, kFileHeaderSize + kInfoHeaderSize);

    put32(out, kInfoHeaderSize);
    put32(out, static_cast<std::uint32_t>(width));
    put32(out, static_cast<std::uint32_t>(height)); // positive: bottom-up rows
    put16(out, 1); // planes
    put16(out, 24); // bits per pixel
    put32(out, 0); // no compression
    put32(out, static_cast<std::uint32_t>(imageBytes));
    put32(out, kPixelsPerMetre);
    put32(out, kPixelsPerMetre);
    put32(out, 0); // colours used
    put32(out, 0); // important colours

    for (std::uint64_t row = height; row-- > 0;) {
        const std::uint32_t* line = picture.pixels.data() + row * width;
        for (std::uint64_t x = 0; x < width; ++x) {
            const std::uint32_t argb = line[x];
            out.push_back(static_cast<std::uint8_t>(argb & 0xFF));
            out.push_back(static_cast<std::uint8_t>((argb >> 8) & 0xFF));
            out.push_back(static_cast<std::uint8_t>((argb >> 16) & 0xFF));
        }
        for (std::uint64_t pad = width * 3; pad < rowBytes; ++pad) {
            out.push_back(0);
        }
    }
    return out;
}

} // namespace penmoor::picture
