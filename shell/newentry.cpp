// Platform file: exclusive creation of files and folders on POSIX and Windows.
#include "shell/newentry.h"

#include "shell/utf8path.h"

#include <stdexcept>

#ifdef _WIN32
#include <windows.h>
#else
#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#endif

namespace penmoor {

#ifdef _WIN32

namespace {

// Paths are wide on Windows; std::filesystem::path converts a UTF-8 text properly when it was
// made with pathFromUtf8, so c_str() is already the wide form the system wants.
NewEntry outcome(BOOL succeeded, std::error_code& error)
{
    if (succeeded) {
        error.clear();
        return NewEntry::Created;
    }
    const DWORD code = GetLastError();
    if (code == ERROR_FILE_EXISTS || code == ERROR_ALREADY_EXISTS) {
        error.clear();
        return NewEntry::NameTaken;
    }
    error = std::error_code(static_cast<int>(code), std::system_category());
    return NewEntry::Failed;
}

} // namespace

NewEntry createNewFile(const std::filesystem::path& path, std::filesystem::perms, std::error_code& error)
{
    const HANDLE file
        = CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW, FILE_ATTRIBUTE_NORMAL, nullptr);
    const BOOL created = file != INVALID_HANDLE_VALUE;
    const NewEntry result = outcome(created, error);
    if (created) {
        CloseHandle(file);
    }
    return result;
}

// A folder in the user's temporary folder inherits that folder's access list, which admits
// only the user.
NewEntry createPrivateFolder(const std::filesystem::path& path, std::error_code& error)
{
    return outcome(CreateDirectoryW(path.c_str(), nullptr), error);
}

#else

namespace {

NewEntry outcome(bool succeeded, std::error_code& error)
{
    if (succeeded) {
        error.clear();
        return NewEntry::Created;
    }
    if (errno == EEXIST) {
        error.clear();
        return NewEntry::NameTaken;
    }
    error = std::error_code(errno, std::generic_category());
    return NewEntry::Failed;
}

} // namespace

NewEntry createNewFile(const std::filesystem::path& path, std::filesystem::perms access, std::error_code& error)
{
    // O_EXCL also refuses a symbolic link of that name, dangling or not.
    const int file = ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC,
        static_cast<mode_t>(access & std::filesystem::perms::mask));
    const NewEntry result = outcome(file >= 0, error);
    if (file >= 0) {
        ::close(file);
    }
    return result;
}

NewEntry createPrivateFolder(const std::filesystem::path& path, std::error_code& error)
{
    return outcome(::mkdir(path.c_str(), S_IRWXU) == 0, error);
}

#endif

NewEntry createNewFile(const std::filesystem::path& path, std::error_code& error)
{
    using std::filesystem::perms;
    return createNewFile(path, perms::owner_read | perms::owner_write, error);
}

std::filesystem::path createUnderFreshName(const std::filesystem::path& folder,
    const std::function<std::string()>& drawName, NewEntry (*create)(const std::filesystem::path&, std::error_code&),
    std::string_view what)
{
    // Fresh names rarely clash; this many clashes in a row means the names are not random.
    constexpr int kMaximumDraws = 1000;
    const auto failure = [&](const std::string& reason) {
        return std::runtime_error(
            "Could not create " + std::string(what) + " in \"" + utf8Text(folder) + "\": " + reason + ".");
    };
    for (int draw = 0; draw < kMaximumDraws; ++draw) {
        std::filesystem::path candidate = folder / drawName();
        std::error_code error;
        switch (create(candidate, error)) {
        case NewEntry::Created:
            return candidate;
        case NewEntry::NameTaken:
            break;
        case NewEntry::Failed:
            throw failure(error.message());
        }
    }
    throw failure("every name drawn was taken");
}

} // namespace penmoor
