#pragma once

#include <string_view>

namespace penmoor {

// Opens the address with the desktop's handler for it (the web browser for a web page).
void openAddressOnDesktop(std::string_view address);

} // namespace penmoor
