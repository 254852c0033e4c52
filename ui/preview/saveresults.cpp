#include "ui/preview/saveresults.h"

#include "shell/errorreport.h"
#include "shell/filereplace.h"
#include "shell/fileutils.h"

#include <cerrno>
#include <cstdint>
#include <fstream>
#include <stdexcept>
#include <string>
#include <system_error>
#include <vector>

namespace penmoor {

namespace {

namespace fs = std::filesystem;

std::string quoted(const fs::path& path)
{
    const std::u8string text = path.u8string();
    return "\"" + std::string(text.begin(), text.end()) + "\"";
}

std::vector<std::uint8_t> readWorkbook(const fs::path& workbook)
{
    const auto failure = [&](const std::error_code& reason) {
        return std::runtime_error(
            "The workbook of the last build cannot be read from " + quoted(workbook) + ": " + reason.message() + ".");
    };
    std::error_code error;
    const std::uintmax_t size = fs::file_size(workbook, error);
    if (error) {
        throw failure(error);
    }
    std::vector<std::uint8_t> bytes(static_cast<std::size_t>(size));
    errno = 0;
    std::ifstream in(workbook, std::ios::binary);
    if (in) {
        in.read(reinterpret_cast<char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    }
    if (!in || in.gcount() != static_cast<std::streamsize>(bytes.size())) {
        throw failure({ errno != 0 ? errno : EIO, std::generic_category() });
    }
    return bytes;
}

void copyWorkbook(const fs::path& workbook, const fs::path& target)
{
    const std::vector<std::uint8_t> bytes = readWorkbook(workbook);
    if (const std::error_code error = replaceFileContents(target, bytes)) {
        throw std::runtime_error("The workbook cannot be saved as " + quoted(target) + ": " + error.message() + ".");
    }
}

} // namespace

void saveResults(Dialogs& dialogs, const fs::path& workbook)
{
    ReportingProcedure procedure(dialogs, errorlocation::Form2PushButton6Click);
    std::string name;
    bool copy = false;
    procedure.step(100, [&] {
        name = dialogs.askSavePath({ std::string(kSaveDialogTitle), std::string(kSaveDialogFilter) });
    });
    procedure.step(102, [&] {
        if (name.empty()) {
            return;
        }
        if (FileExists(pathFromUtf8(name))) {
            const MessageRequest question
                = MessageRequest::plain("Are you sure you wish to overwrite " + name + " ?", MessageButtons::YesNo);
            copy = dialogs.showMessage(question) == DialogAnswer::Yes;
        } else {
            copy = true;
        }
    });
    procedure.step(104, [&] {
        if (copy) {
            copyWorkbook(workbook, pathFromUtf8(name));
        }
    });
    procedure.step(106, [&] { dialogs.showMessage(MessageRequest::plain("Done.")); });
}

} // namespace penmoor
