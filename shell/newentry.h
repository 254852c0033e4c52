#pragma once

#include <filesystem>
#include <functional>
#include <string>
#include <string_view>
#include <system_error>

namespace penmoor {

// The outcome of creating a file or folder that must not exist yet.
enum class NewEntry {
    Created,
    NameTaken, // something of that name exists: draw another name
    Failed, // the system refused for another reason, given in the error code
};

// Creates an empty file at path in one step that fails when anything of that name exists, so
// no other process can take the name between a check and the creation. Only the user may
// read and write it.
NewEntry createNewFile(const std::filesystem::path& path, std::error_code& error);

// The same with the given permissions, less those the process's file creation mask withholds.
// On Windows the file takes the access list of its folder instead.
NewEntry createNewFile(const std::filesystem::path& path, std::filesystem::perms access, std::error_code& error);

// Creates a folder at path that only the user can enter, read and write, failing in the same
// way when anything of that name exists.
NewEntry createPrivateFolder(const std::filesystem::path& path, std::error_code& error);

// Creates a new file or folder (create is createNewFile or createPrivateFolder) in folder under
// names from drawName, drawing the next name at once while one is taken, and returns its path.
// Raises std::runtime_error "Could not create <what> in "<folder>": <reason>." when the system
// refuses or the names drawn keep being taken.
std::filesystem::path createUnderFreshName(const std::filesystem::path& folder,
    const std::function<std::string()>& drawName, NewEntry (*create)(const std::filesystem::path&, std::error_code&),
    std::string_view what);

} // namespace penmoor
