#pragma once

#include <filesystem>
#include <string_view>

namespace penmoor {

// The build writes this file beside every executable it builds; installing never copies it.
inline constexpr std::string_view kBuildTreeMarker = "penmoor-build-tree";
// "1" says the program runs in development, "0" says it does not, whatever the folder.
inline constexpr std::string_view kInIdeVariable = "PENMOOR_IN_IDE";

// True when the program runs in development rather than as an installed program: when the
// variable PENMOOR_IN_IDE is "1", or, unless it is "0", when programFolder holds the build
// tree's marker. variableValue is the variable's value, null when it is not set.
bool IsInIDE(const std::filesystem::path& programFolder, const char* variableValue);

// The same, reading the variable from the environment.
bool IsInIDE(const std::filesystem::path& programFolder);

} // namespace penmoor
