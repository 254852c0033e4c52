#include "automation/privatefolder.h"

#include "shell/newentry.h"

#include <algorithm>
#include <string>

namespace penmoor {

namespace {

std::string folderName(const UnitRandom& random)
{
    constexpr int kDigitCount = 12;
    std::string name = "penmoor-";
    for (int i = 0; i < kDigitCount; ++i) {
        name += static_cast<char>('0' + std::clamp(static_cast<int>(random() * 10.0), 0, 9));
    }
    return name;
}

} // namespace

PrivateFolder::PrivateFolder(const std::filesystem::path& parent, const UnitRandom& random)
    : m_path(createUnderFreshName(
        parent, [&] { return folderName(random); }, createPrivateFolder, "a private folder for the sheet picture"))
{
}

PrivateFolder::~PrivateFolder()
{
    // A folder left behind is harmless, and removing it must never interrupt the build.
    std::error_code ignored;
    std::filesystem::remove_all(m_path, ignored);
}

} // namespace penmoor
