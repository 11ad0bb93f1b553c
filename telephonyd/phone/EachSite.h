#pragma once

#include <array>
#include <cstddef>

namespace orvane
{

// Calls the function for each site of a town and returns an array of its results.
template <typename Site, std::size_t count, typename Function>
constexpr auto ofEach(const Site (&sites)[count], Function function)
{
    std::array<decltype(function(sites[0])), count> results{};
    for (std::size_t i = 0; i < count; ++i)
        results[i] = function(sites[i]);
    return results;
}

} // namespace orvane
