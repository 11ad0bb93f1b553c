#pragma once

#include "telephonyd/phone/DataConnections.h"
#include "telephonyd/phone/DrivenScenario.h"
#include "telephonyd/phone/LTEPackets.h"
#include "telephonyd/phone/Phases.h"

namespace orvane
{

// A phone on LTE that is driven through a town. It changes cells, is idle and connected by turns,
// and has a data connection that comes and goes.
class LTEScenario final : public DrivenScenario
{
public:
    explicit LTEScenario(std::uint64_t seed);

private:
    void first() override;
    void next() override;
    void addServingCell();
    void addServingMeasurement(bool rulesUpdated);
    void addConnectedMeasurement();
    void addNeighbours();
    void addReselection();
    void addCells();
    [[nodiscard]] LTELevels levels(std::size_t cell) const;
    [[nodiscard]] std::vector<LTELevels> levelsOf(const std::vector<std::size_t>& cells) const;

    Phases _connected;
    DataConnections _dataConnections;
    unsigned _reselections = 0;
};

} // namespace orvane
