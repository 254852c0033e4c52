#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace penmoor::xls::test {

// One line per record of a BIFF stream, "0x0809 16 00 06 05 00 ...", so that a failing
// comparison shows the record that differs. Stops at the zero padding after the last EOF.
std::vector<std::string> dumpRecords(std::span<const std::uint8_t> stream);

// "00 06 05 00" for these bytes, and back.
std::string hex(std::span<const std::uint8_t> bytes);
std::vector<std::uint8_t> fromHex(const std::string& text);

} // namespace penmoor::xls::test
