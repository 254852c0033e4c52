#include "shell/filereplace.h"

#include <cerrno>
#include <fstream>
#include <random>
#include <string>

#ifdef _WIN32
#include <windows.h>
#endif

namespace penmoor {

namespace {

namespace fs = std::filesystem;

// A name beside the target that no other file has.
fs::path temporaryBeside(const fs::path& target)
{
    std::random_device seed;
    std::mt19937_64 random((std::uint64_t { seed() } << 32) | seed());
    for (;;) {
        fs::path candidate = target;
        candidate += ".~" + std::to_string(random() % 1000000000) + ".tmp";
        std::error_code ignored; // an unreadable folder shows when the file is created
        if (!fs::exists(candidate, ignored)) {
            return candidate;
        }
    }
}

std::error_code writeWhole(const fs::path& path, std::span<const std::uint8_t> bytes)
{
    errno = 0;
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    if (out) {
        out.write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    }
    if (out) {
        out.close();
    }
    if (out) {
        return {};
    }
    const int code = errno != 0 ? errno : EIO;
    std::error_code ignored; // the partial file is removed as far as the system lets us
    fs::remove(path, ignored);
    return { code, std::generic_category() };
}

} // namespace

std::error_code moveFileOver(const fs::path& from, const fs::path& to)
{
    std::error_code error;
#ifdef _WIN32
    if (!MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH)) {
        error = std::error_code(static_cast<int>(GetLastError()), std::system_category());
    }
#else
    fs::rename(from, to, error);
#endif
    return error;
}

std::error_code replaceFileContents(const fs::path& target, std::span<const std::uint8_t> bytes)
{
    const fs::path temporary = temporaryBeside(target);
    if (const std::error_code error = writeWhole(temporary, bytes)) {
        return error;
    }
    const std::error_code error = moveFileOver(temporary, target);
    if (error) {
        std::error_code ignored; // the complete but unplaced copy must not stay behind
        fs::remove(temporary, ignored);
    }
    return error;
}

} // namespace penmoor
