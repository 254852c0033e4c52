#pragma once

#include "automation/contract/error.h"

#include <filesystem>
#include <memory>
#include <string>
#include <string_view>

namespace penmoor {

// The object a build step works on, or xl::Error when an earlier step that was to provide it
// failed: the later step then fails and is reported in its turn instead of crashing.
[[noreturn]] inline void throwMissing(std::string_view what)
{
    throw xl::Error("The " + std::string(what) + " is not available, because the step that was to provide it failed.");
}

template <typename Object> Object& existing(const std::unique_ptr<Object>& object, std::string_view what)
{
    if (!object) {
        throwMissing(what);
    }
    return *object;
}

// The same for a path that an earlier step was to choose.
inline const std::filesystem::path& existing(const std::filesystem::path& path, std::string_view what)
{
    if (path.empty()) {
        throwMissing(what);
    }
    return path;
}

} // namespace penmoor
