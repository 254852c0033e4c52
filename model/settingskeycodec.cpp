#include "model/settingskeycodec.h"

namespace penmoor {

std::string encodeSettingsKey(std::string_view key)
{
    if (key.empty()) {
        return ".";
    }
    constexpr std::string_view hexDigits = "0123456789abcdef";
    std::string encoded;
    encoded.reserve(key.size() * 2);
    for (const char c : key) {
        if ((c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || c == '-') {
            encoded += c;
        } else if (c >= 'A' && c <= 'Z') {
            encoded += '_';
            encoded += static_cast<char>(c - 'A' + 'a');
        } else {
            const auto byte = static_cast<unsigned char>(c);
            encoded += '.';
            encoded += hexDigits[byte >> 4];
            encoded += hexDigits[byte & 0x0f];
        }
    }
    return encoded;
}

} // namespace penmoor
