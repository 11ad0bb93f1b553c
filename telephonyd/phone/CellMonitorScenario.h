#pragma once

#include "platform/base/PropertyValue.h"
#include "telephonyd/phone/Drive.h"
#include "telephonyd/phone/Phases.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// A phone on GSM that is driven through a town, as its telephony server lists the cells itself:
// once a second, and when something has changed, a property list of dictionaries, arrays and texts.
class CellMonitorScenario final : public Scenario
{
public:
    explicit CellMonitorScenario(std::uint64_t seed);

    [[nodiscard]] std::string technology() const override;
    std::vector<PhoneMessage> step(std::chrono::milliseconds now) override;

private:
    [[nodiscard]] PhoneMessage cellList() const;
    [[nodiscard]] PropertyValue network() const;
    [[nodiscard]] PropertyValue servingCell() const;
    [[nodiscard]] PropertyValue neighbourCells() const;

    Drive _drive;
    Phases _call;
    std::chrono::milliseconds _now{-1}; // before the first step
};

} // namespace orvane
