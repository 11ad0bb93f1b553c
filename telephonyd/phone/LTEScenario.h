#pragma once

#include "telephonyd/phone/Drive.h"
#include "telephonyd/phone/LTEPackets.h"
#include "telephonyd/phone/Phases.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// A phone on LTE that is driven through a town. It goes from cell to cell, is now idle and now in a
// connection, and has a data connection that comes up and goes.
class LTEScenario final : public Scenario
{
public:
    explicit LTEScenario(std::uint64_t seed);

    [[nodiscard]] std::string technology() const override;
    std::vector<PhoneMessage> step(std::chrono::milliseconds now) override;

private:
    using Messages = std::vector<PhoneMessage>;

    void first(Messages& messages);
    void next(Messages& messages);
    void addServingCell(Messages& messages) const;
    void addServingMeasurement(Messages& messages, bool rulesUpdated) const;
    void addConnectedMeasurement(Messages& messages) const;
    void addNeighbours(Messages& messages) const;
    void addReselection(Messages& messages);
    void addCells(Messages& messages) const;
    void addDataConnections(Messages& messages) const;
    [[nodiscard]] bool isDue(std::chrono::milliseconds every) const;
    [[nodiscard]] LTELevels levels(std::size_t cell) const;
    [[nodiscard]] std::vector<LTELevels> levelsOf(const std::vector<std::size_t>& cells) const;

    Drive _drive;
    Phases _connected;
    Phases _dataConnection;
    std::chrono::milliseconds _now{-1}; // before the first step
    unsigned _reselections = 0;
    unsigned _dataConnections = 1; // that there have been
};

} // namespace orvane
