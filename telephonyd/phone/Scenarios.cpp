#include "telephonyd/phone/Scenarios.h"

#include "telephonyd/phone/CDMAScenario.h"
#include "telephonyd/phone/CellMonitorScenario.h"
#include "telephonyd/phone/LTEScenario.h"
#include "telephonyd/phone/PhoneSource.h"
#include "telephonyd/phone/UMTSScenario.h"
#include "telephonyd/phone/UTRANScenario.h"

namespace orvane
{

namespace
{

template <typename Kind>
std::unique_ptr<Scenario> make(std::uint64_t seed)
{
    return std::make_unique<Kind>(seed);
}

struct Entry {
    const char* name;
    std::unique_ptr<Scenario> (*make)(std::uint64_t seed);
};

constexpr Entry kScenarios[] = {
    {"lte",         make<LTEScenario>        },
    {"umts",        make<UMTSScenario>       },
    {"utran",       make<UTRANScenario>      },
    {"cdma",        make<CDMAScenario>       },
    {"cellmonitor", make<CellMonitorScenario>},
};

} // namespace

std::vector<std::string> scenarioNames()
{
    std::vector<std::string> names;
    for (const Entry& entry : kScenarios)
        names.emplace_back(entry.name);
    return names;
}

std::unique_ptr<Scenario> makeScenario(std::string_view name, std::uint64_t seed)
{
    for (const Entry& entry : kScenarios)
        if (name == entry.name)
            return entry.make(seed);
    return nullptr;
}

LogSourceFactory phoneSourceFactory(std::string scenario, MainQueue& queue)
{
    // A start near the edge of a cell, so that there is something to see soon.
    constexpr std::uint64_t kSeed = 6;
    return [name = std::move(scenario), &queue]() -> std::unique_ptr<LogSource> {
        auto phone = makeScenario(name, kSeed);
        return phone ? std::make_unique<PhoneSource>(queue, std::move(phone)) : nullptr;
    };
}

} // namespace orvane
