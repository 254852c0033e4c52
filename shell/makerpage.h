#pragma once

#include "shell/unitrandom.h"

#include <functional>
#include <string_view>

namespace penmoor {

inline constexpr std::string_view kMakerPageAddress = "https://www.penmoor.example/";

// Opens an address in the desktop's web browser.
using AddressOpener = std::function<void(std::string_view address)>;

// True for the one draw in a hundred that opens the maker's page: n = floor(r * 100) + 1
// is 7.
bool isMakerPageDraw(double r);

// At one start in a hundred, on average, opens the maker's web page.
void OpenMakerPage(const UnitRandom& random, const AddressOpener& open);

} // namespace penmoor
