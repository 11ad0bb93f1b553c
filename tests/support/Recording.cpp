#include "support/Recording.h"
#include "support/Paths.h"

namespace orvane
{

std::optional<Bytes> MemoryResources::load(std::string_view name, std::string_view type) const
{
    const auto found = _files.find(std::string(name) + "." + std::string(type));
    return found == _files.end() ? std::nullopt : std::optional<Bytes>(found->second);
}

std::vector<std::string> MemoryResources::pathsOfType(std::string_view type) const
{
    std::vector<std::string> paths;
    for (const auto& [name, content] : _files)
        if (name.ends_with("." + std::string(type)))
            paths.push_back("/resources/" + name);
    return paths;
}

void MemoryResources::put(const std::string& fileName, std::string_view text)
{
    _files[fileName] = Bytes(text.begin(), text.end());
}

TestServices::TestServices() : shippedResources(shippedResourcesPath())
{
    Services& services = Services::current();
    services.setLog(&log);
    services.setConsole(&console);
    services.setResources(&memoryResources);
    services.setClock(&clock);
}

TestServices::~TestServices()
{
    Services& services = Services::current();
    services.setLog(nullptr);
    services.setConsole(nullptr);
    services.setResources(nullptr);
    services.setClock(nullptr);
}

void TestServices::useShippedResources() { Services::current().setResources(&shippedResources); }

} // namespace orvane
