#pragma once

#include <cstdint>
#include <filesystem>
#include <span>
#include <system_error>

namespace penmoor {

// Gives the file at target exactly these bytes. They are written to a new file beside it first
// and that file is then renamed over target in one step, so target is never half-written and an
// existing file there is replaced only once its successor is complete. On failure target is as
// it was, nothing is left beside it, and the result holds the system's reason; it is empty on
// success. The new file is created so that nothing already there (a planted link, say) is
// followed, and it keeps the permissions of the file it replaces.
[[nodiscard]] std::error_code replaceFileContents(
    const std::filesystem::path& target, std::span<const std::uint8_t> bytes);

// Gives successor, a file about to be moved over target, the permissions that target has, or
// those a new file gets when there is none: a private file stays private, and a file made
// privately for a build ends up as the user expects. Best effort; Windows files take their
// folder's access list.
void giveAccessOf(const std::filesystem::path& target, const std::filesystem::path& successor);

// Moves the file from over to in one step, replacing a file at to. POSIX rename does that; on
// Windows the C runtime's rename refuses an existing target, so the system is asked to replace
// it. Empty on success, otherwise the system's reason.
[[nodiscard]] std::error_code moveFileOver(const std::filesystem::path& from, const std::filesystem::path& to);

} // namespace penmoor
