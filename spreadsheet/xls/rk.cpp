#include "spreadsheet/xls/rk.h"

#include <bit>
#include <cmath>

namespace penmoor::xls {

namespace {

constexpr std::uint32_t kDividedBy100 = 0x01;
constexpr std::uint32_t kInteger = 0x02;
constexpr double kIntegerLimit = 536870912.0; // 2^29
constexpr std::uint64_t kLowDoubleBits = (std::uint64_t { 1 } << 34) - 1;

std::optional<std::uint32_t> encodeInteger(double value)
{
    if (!(value >= -kIntegerLimit && value < kIntegerLimit) || value != std::floor(value)
        || (value == 0 && std::signbit(value)))
        return std::nullopt;
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(value) * 4) | kInteger;
}

std::optional<std::uint32_t> encodeTruncatedDouble(double value)
{
    const auto bits = std::bit_cast<std::uint64_t>(value);
    if ((bits & kLowDoubleBits) != 0)
        return std::nullopt;
    return static_cast<std::uint32_t>(bits >> 32);
}

} // namespace

std::optional<std::uint32_t> encodeRk(double value)
{
    if (!std::isfinite(value))
        return std::nullopt;
    if (auto rk = encodeInteger(value))
        return rk;
    if (auto rk = encodeTruncatedDouble(value))
        return rk;
    // Values with two decimals, such as 12.34, fit as hundredths when the division gives them back.
    const double hundredths = value * 100;
    if (auto rk = encodeInteger(hundredths); rk && decodeRk(*rk | kDividedBy100) == value)
        return *rk | kDividedBy100;
    if (auto rk = encodeTruncatedDouble(hundredths); rk && decodeRk(*rk | kDividedBy100) == value)
        return *rk | kDividedBy100;
    return std::nullopt;
}

double decodeRk(std::uint32_t rk)
{
    double value = 0;
    if (rk & kInteger)
        value = static_cast<double>(static_cast<std::int32_t>(rk) >> 2);
    else
        value = std::bit_cast<double>(std::uint64_t { rk & ~std::uint32_t { 3 } } << 32);
    return (rk & kDividedBy100) ? value / 100 : value;
}

} // namespace penmoor::xls
