#include "spreadsheet/xls/xlsfile.h"

#include "automation/contract/error.h"
#include "spreadsheet/xls/filereplace.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/xlsreader.h"
#include "spreadsheet/xls/xlswriter.h"

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <random>

namespace penmoor::xls {

namespace {

namespace fs = std::filesystem;

// A compound file of version 3 stays below 2 GB.
constexpr std::uintmax_t kMaxFileSize = 0x7FFFFFFF;

fs::path filePath(const std::string& utf8)
{
    return fs::path(std::u8string(utf8.begin(), utf8.end()));
}

std::string systemReason(int code)
{
    return std::generic_category().message(code);
}

// A name beside the target that no other file has, for writing the new workbook first.
fs::path temporaryBeside(const fs::path& target)
{
    std::random_device seed;
    std::mt19937_64 random((std::uint64_t { seed() } << 32) | seed());
    for (;;) {
        fs::path candidate = target;
        candidate += ".~" + std::to_string(random() % 1000000000) + ".tmp";
        std::error_code ignored; // an unreadable folder shows when the file is created
        if (!fs::exists(candidate, ignored))
            return candidate;
    }
}

void writeWhole(const fs::path& path, const std::vector<std::uint8_t>& bytes, const std::string& shownPath)
{
    errno = 0;
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    if (out)
        out.write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    if (out)
        out.close();
    if (!out) {
        const int code = errno != 0 ? errno : EIO;
        std::error_code ignored; // the partial file is removed as far as the system lets us
        fs::remove(path, ignored);
        throw xl::Error("The workbook cannot be saved as \"" + shownPath + "\": " + systemReason(code) + ".");
    }
}

} // namespace

void saveXlsFile(const engine::Workbook& workbook, const std::string& path)
{
    std::vector<std::uint8_t> bytes;
    try {
        bytes = writeXls(workbook);
    } catch (const WriteError& error) {
        throw xl::Error("The workbook cannot be saved as \"" + path + "\": " + error.what() + ".");
    }
    const fs::path target = filePath(path);
    const fs::path temporary = temporaryBeside(target);
    writeWhole(temporary, bytes, path);
    std::error_code error;
    replaceFile(temporary, target, error);
    if (error) {
        std::error_code ignored; // the complete but unplaced copy must not stay behind
        fs::remove(temporary, ignored);
        throw xl::Error("The workbook cannot be saved as \"" + path + "\": " + error.message() + ".");
    }
}

engine::Workbook openXlsFile(const std::string& path)
{
    const fs::path source = filePath(path);
    std::error_code error;
    const std::uintmax_t size = fs::file_size(source, error);
    if (error)
        throw xl::Error("The workbook \"" + path + "\" cannot be opened: " + error.message() + ".");
    if (size > kMaxFileSize)
        throw xl::Error(path + " is not a readable .xls workbook: it is larger than an .xls file can be.");
    std::vector<std::uint8_t> bytes(static_cast<std::size_t>(size));
    errno = 0;
    std::ifstream in(source, std::ios::binary);
    if (in)
        in.read(reinterpret_cast<char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    if (!in || in.gcount() != static_cast<std::streamsize>(bytes.size()))
        throw xl::Error(
            "The workbook \"" + path + "\" cannot be opened: " + systemReason(errno != 0 ? errno : EIO) + ".");
    try {
        return readXls(bytes);
    } catch (const FormatError& reason) {
        throw xl::Error(path + " is not a readable .xls workbook: " + reason.what() + ".");
    }
}

} // namespace penmoor::xls
