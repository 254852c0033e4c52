#include "spreadsheet/xls/xlsfile.h"

#include "automation/contract/error.h"
#include "shell/filereplace.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/xlsreader.h"
#include "spreadsheet/xls/xlswriter.h"

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <fstream>

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

} // namespace

void saveXlsFile(const engine::Workbook& workbook, const std::string& path)
{
    std::vector<std::uint8_t> bytes;
    try {
        bytes = writeXls(workbook);
    } catch (const WriteError& error) {
        throw xl::Error("The workbook cannot be saved as \"" + path + "\": " + error.what() + ".");
    }
    if (const std::error_code error = replaceFileContents(filePath(path), bytes))
        throw xl::Error("The workbook cannot be saved as \"" + path + "\": " + error.message() + ".");
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
