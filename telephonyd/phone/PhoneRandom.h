#pragma once

#include <cstdint>
#include <random>

namespace orvane
{

// Random numbers of the simulated phone. A seed gives the same numbers with every compiler, which
// the distributions of the standard library do not guarantee.
class PhoneRandom
{
public:
    explicit PhoneRandom(std::uint64_t seed) : _engine(seed) {}

    // At least `low`, below `high`.
    double between(double low, double high)
    {
        constexpr double kUnit = 0x1p-53;
        return low + (high - low) * static_cast<double>(_engine() >> 11) * kUnit;
    }
    // 0 to count - 1.
    std::uint32_t below(std::uint32_t count)
    {
        return static_cast<std::uint32_t>(between(0, count));
    }

private:
    std::mt19937_64 _engine;
};

} // namespace orvane
