#pragma once

#include <array>
#include <cstddef>

namespace orvane
{

// An array of what the function makes of each site of a town.
template <typename Site, std::size_t count, typename Function>
constexpr auto ofEach(const Site (&sites)[count], Function function)
{
    std::array<decltype(function(sites[0])), count> results{};
    for (std::size_t i = 0; i < count; ++i)
        results[i] = function(sites[i]);
    return results;
}

} // namespace orvane
