#pragma once

#include "telephonyd/phone/CDMAPhone.h"
#include "telephonyd/phone/CDMARadio.h"
#include "telephonyd/phone/DrivenScenario.h"
#include "telephonyd/phone/EvdoTraffic.h"
#include "telephonyd/phone/PilotSet.h"

namespace orvane
{

// A phone on CDMA 1x and EV-DO that is driven through a town. It makes calls on 1x, moves data over
// EV-DO between calls, and receives several cells at a time while connected.
class CDMAScenario final : public DrivenScenario
{
public:
    explicit CDMAScenario(std::uint64_t seed);

private:
    void first() override;
    void next() override;
    void moveData(const CDMAAir& air);
    void reportOneX(const CDMAAir& air, bool somethingChanged);
    void reportEvdo(const CDMAAir& air, bool stateChanged, bool pilotsChanged);
    void addStatus(const CDMAAir& air);
    void addFrame(const CDMAAir& air);
    void addSystem();
    void addSummary(const CDMAAir& air);
    void addActiveSet(const CDMAAir& air);
    void addFingers(const CDMAAir& air);
    void addForwardTraffic();
    void addReverseTraffic();
    [[nodiscard]] bool isEvdoFound() const;
    [[nodiscard]] const CDMACell& servingCell() const;
    [[nodiscard]] CDMARadio radio(const CDMAAir& air, std::uint8_t band, std::uint16_t channel);

    CDMAPhone _phone;
    PilotSet _oneXPilots;
    PilotSet _evdoPilots;
    EvdoForwardTraffic _forward;
    EvdoReverseTraffic _reverse;
    PhoneRandom _noise;
    double _share = 0.3; // of the sector's time
};

} // namespace orvane
