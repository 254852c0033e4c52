#pragma once

#include "shell/unitrandom.h"

#include <filesystem>

namespace penmoor {

// A folder of the build's own inside the shared temporary folder, which only the user can
// enter. Files the build writes there can neither replace a file of the user's nor be
// redirected by another user's link. The folder goes, with what is in it, when the object dies.
class PrivateFolder {
public:
    // Raises std::runtime_error, with the system's reason, when parent does not take it.
    PrivateFolder(const std::filesystem::path& parent, const UnitRandom& random);
    PrivateFolder(const PrivateFolder&) = delete;
    PrivateFolder& operator=(const PrivateFolder&) = delete;
    ~PrivateFolder();

    const std::filesystem::path& path() const { return m_path; }

private:
    std::filesystem::path m_path;
};

} // namespace penmoor
