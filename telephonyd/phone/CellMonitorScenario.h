#pragma once

#include "platform/base/PropertyValue.h"
#include "telephonyd/phone/DrivenScenario.h"
#include "telephonyd/phone/Phases.h"

namespace orvane
{

// A phone on GSM that is driven through a town. Its telephony server lists the cells itself, once a
// second and whenever something changes, as a property list of dictionaries, arrays and texts.
class CellMonitorScenario final : public DrivenScenario
{
public:
    explicit CellMonitorScenario(std::uint64_t seed);

private:
    void first() override { add(cellList()); }
    void next() override;
    [[nodiscard]] PhoneMessage cellList() const;
    [[nodiscard]] PropertyValue network() const;
    [[nodiscard]] PropertyValue servingCell() const;
    [[nodiscard]] PropertyValue neighbourCells() const;

    Phases _call;
};

} // namespace orvane
