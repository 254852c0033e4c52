#pragma once

#include "model/settingsstore.h"

#include <filesystem>
#include <string_view>

namespace penmoor {

// "0" (or absent): show the splash window at start; "1": the user ticked it away.
inline constexpr std::string_view kShowAgainKey = "ShowAgain";
inline constexpr std::string_view kSplashFolder = "Splash";

// Whether the splash window is to be shown: the stored "ShowAgain" is the number 0. A text
// that is not a number counts as the default "0".
bool isSplashWanted(const SettingsStore& settings);

// The splash picture: the first file, by name, of the "Splash" folder in programFolder,
// skipping hidden files and folders. Empty when there is none or the folder is missing.
std::filesystem::path splashPicturePath(const std::filesystem::path& programFolder);

} // namespace penmoor
