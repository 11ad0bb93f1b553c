#pragma once

#include "platform/services/MainQueue.h"
#include "telephonyd/phone/LogSource.h"
#include "telephonyd/phone/Scenario.h"

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// The scenarios that there are, by their names on the command line.
std::vector<std::string> scenarioNames();
// Null when there is none of that name.
std::unique_ptr<Scenario> makeScenario(std::string_view name, std::uint64_t seed);

// Gives each log channel a phone of its own, all with the same seed. The queue must outlive the
// sources. Makes no source if there is no scenario of that name.
LogSourceFactory phoneSourceFactory(std::string scenario, MainQueue& queue);

} // namespace orvane
