#pragma once

#include <cstdint>
#include <optional>

namespace penmoor::xls {

// RK values: a number in 4 bytes when it fits exactly, either as a 30-bit integer or as the top
// 30 bits of a double, optionally divided by 100. Nothing when it does not fit exactly.
std::optional<std::uint32_t> encodeRk(double value);
double decodeRk(std::uint32_t rk);

} // namespace penmoor::xls
