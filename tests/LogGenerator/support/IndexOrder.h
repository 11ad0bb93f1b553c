#pragma once

#include "LogGenerator/ClassIndex.h"

#include <algorithm>
#include <string>
#include <vector>

namespace orvane
{

// The names of the sections that subscribe to the code, in order.
inline std::vector<std::string> subscribers(const ClassIndex& index, std::uint32_t code)
{
    std::vector<std::string> names;
    if (const auto* sections = index.getSubscribers(code))
        for (const Base* section : *sections)
            names.push_back(section->getSectionName());
    return names;
}

// Those of `all` that are among `some`, in the order of `all`. A test that compares this with
// `some` claims that these are there in this order, and stays true when another section is added.
template <typename T>
std::vector<T> onlyThose(const std::vector<T>& some, std::vector<T> all)
{
    std::erase_if(all, [&some](const T& each) {
        return std::find(some.begin(), some.end(), each) == some.end();
    });
    return all;
}

} // namespace orvane
