#include "shell/filereplace.h"

#include "shell/newentry.h"

#include <cerrno>
#include <fstream>
#include <random>
#include <string>

#ifdef _WIN32
#include <windows.h>
#else
#include <sys/stat.h>
#endif

namespace penmoor {

namespace {

namespace fs = std::filesystem;

// Creates a new, empty file beside target under a name that no other file has. The creation
// fails when anything of that name exists, so no other process can slip a file or a link in
// its place between choosing the name and writing.
std::error_code createBeside(const fs::path& target, fs::path& created)
{
    // Fresh names rarely clash; this many clashes in a row means the names are not random.
    constexpr int kMaximumDraws = 1000;
    constexpr fs::perms kNewFileAccess = fs::perms::owner_read | fs::perms::owner_write | fs::perms::group_read
        | fs::perms::group_write | fs::perms::others_read | fs::perms::others_write;
    std::random_device seed;
    std::mt19937_64 random((std::uint64_t { seed() } << 32) | seed());
    for (int draw = 0; draw < kMaximumDraws; ++draw) {
        fs::path candidate = target;
        candidate += ".~" + std::to_string(random() % 1000000000) + ".tmp";
        std::error_code error;
        switch (createNewFile(candidate, kNewFileAccess, error)) {
        case NewEntry::Created:
            created = candidate;
            return {};
        case NewEntry::NameTaken:
            break;
        case NewEntry::Failed:
            return error;
        }
    }
    return std::make_error_code(std::errc::file_exists);
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

void giveAccessOf(const fs::path& target, const fs::path& successor)
{
    std::error_code error;
    const fs::file_status status = fs::status(target, error);
    if (!error && fs::is_regular_file(status)) {
        fs::permissions(successor, status.permissions(), error); // best effort: the bytes matter most
        return;
    }
#ifndef _WIN32
    // What a new file gets: read and write for all, less the process's file creation mask.
    const mode_t mask = ::umask(0);
    ::umask(mask);
    fs::permissions(successor, static_cast<fs::perms>(0666 & ~mask), error);
#endif
}

std::error_code replaceFileContents(const fs::path& target, std::span<const std::uint8_t> bytes)
{
    fs::path temporary;
    if (const std::error_code error = createBeside(target, temporary)) {
        return error;
    }
    if (const std::error_code error = writeWhole(temporary, bytes)) {
        return error;
    }
    giveAccessOf(target, temporary);
    const std::error_code error = moveFileOver(temporary, target);
    if (error) {
        std::error_code ignored; // the complete but unplaced copy must not stay behind
        fs::remove(temporary, ignored);
    }
    return error;
}

} // namespace penmoor
