#pragma once

#include "telephonyd/phone/DataConnections.h"
#include "telephonyd/phone/DrivenScenario.h"
#include "telephonyd/phone/Phases.h"
#include "telephonyd/phone/RadioConnection.h"

namespace orvane
{

// A phone on UTRAN that is driven through a town. It changes cells, registers where the location
// area changes, is idle or connected in various states, and has a data connection that comes and
// goes.
class UTRANScenario final : public DrivenScenario
{
public:
    explicit UTRANScenario(std::uint64_t seed);

private:
    void first() override;
    void next() override;
    void changeCell();
    void addServingCell();
    void addNeighbours();
    void addGSMNeighbours();
    void addChannelQuality();
    void addCells();

    RadioConnection _radio;
    DataConnections _dataConnections;
    PhoneRandom _noise;
    std::uint16_t _locationArea = 0; // that of the serving cell
    bool _isRegistering = false;     // in it
    std::chrono::milliseconds _registeredAt{0};
};

} // namespace orvane
