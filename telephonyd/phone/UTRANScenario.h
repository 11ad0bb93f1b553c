#pragma once

#include "telephonyd/phone/Drive.h"
#include "telephonyd/phone/Phases.h"
#include "telephonyd/phone/RadioConnection.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// A phone on UTRAN that is driven through a town. It goes from cell to cell, registers where the
// location area changes, is now idle and now in a connection of one state or another, and has a
// data connection that comes up and goes.
class UTRANScenario final : public Scenario
{
public:
    explicit UTRANScenario(std::uint64_t seed);

    [[nodiscard]] std::string technology() const override;
    std::vector<PhoneMessage> step(std::chrono::milliseconds now) override;

private:
    using Messages = std::vector<PhoneMessage>;

    void first(Messages& messages);
    void next(Messages& messages);
    void changeCell(Messages& messages);
    void addServingCell(Messages& messages) const;
    void addNeighbours(Messages& messages) const;
    void addGSMNeighbours(Messages& messages) const;
    void addChannelQuality(Messages& messages);
    void addCells(Messages& messages) const;
    void addDataConnections(Messages& messages) const;
    [[nodiscard]] bool isDue(std::chrono::milliseconds every) const;

    Drive _drive;
    RadioConnection _radio;
    Phases _dataConnection;
    PhoneRandom _noise;
    std::chrono::milliseconds _now{-1}; // before the first step
    std::uint16_t _locationArea = 0;    // that of the serving cell
    bool _isRegistering = false;        // in it
    std::chrono::milliseconds _registeredAt{0};
    unsigned _dataConnections = 1; // that there have been
};

} // namespace orvane
