#include "model/namematching.h"

namespace penmoor {

std::string nameMatchKey(std::string_view name)
{
    std::string key(name);
    if (const std::size_t ampersand = key.find('&'); ampersand != std::string::npos) {
        key.erase(ampersand, 1);
    }
    return key;
}

bool namesMatch(std::string_view first, std::string_view second)
{
    return nameMatchKey(first) == nameMatchKey(second);
}

} // namespace penmoor
