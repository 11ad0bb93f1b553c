#include "LogGenerator/TechnologyOption.h"

#include "LogGenerator/LogTechnology.h"
#include "platform/base/CommandLine.h"

namespace orvane
{

std::optional<std::string> technologyFromOption(CommandLine& line)
{
    const std::optional<std::string> name = line.value(kTechnologyOption);
    if (!name)
        return std::nullopt;
    auto technology = technologyNamed(*name);
    if (!technology)
        line.fail("there is no technology \"" + *name + "\": --technology takes " +
                  technologyNames());
    return technology;
}

} // namespace orvane
