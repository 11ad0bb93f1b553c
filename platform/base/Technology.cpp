#include "platform/base/Technology.h"

namespace orvane
{

std::optional<std::string> technologyNamed(std::string_view name)
{
    for (const Technology& technology : kTechnologies)
        if (name == technology.name)
            return technology.constant;
    return std::nullopt;
}

std::string nameOfTechnology(std::string_view constant)
{
    for (const Technology& technology : kTechnologies)
        if (constant == technology.constant)
            return technology.name;
    return "";
}

std::string technologyNames()
{
    std::string names;
    for (const Technology& technology : kTechnologies)
        names += (names.empty() ? "" : ", ") + std::string(technology.name);
    return names;
}

} // namespace orvane
