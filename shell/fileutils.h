#pragma once

#include <filesystem>
#include <string_view>

// <windows.h> defines DeleteFile as a macro; a file that includes it must #undef DeleteFile
// before this header so that every file sees the same name.

namespace penmoor {

// A path from a UTF-8 text (dialog answers, settings), the same on every platform.
std::filesystem::path pathFromUtf8(std::string_view text);

// True when path names a file (not a folder) whose modification time can be read; false on
// any failure: empty or malformed path, missing folder, no access.
bool FileExists(const std::filesystem::path& path);

// Deletes the file at path. Every failure is ignored, and a folder is never removed.
void DeleteFile(const std::filesystem::path& path);

} // namespace penmoor
