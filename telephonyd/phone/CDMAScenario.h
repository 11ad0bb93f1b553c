#pragma once

#include "telephonyd/phone/CDMAPhone.h"
#include "telephonyd/phone/CDMARadio.h"
#include "telephonyd/phone/EvdoTraffic.h"
#include "telephonyd/phone/PilotSet.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// A phone on CDMA 1x and EV-DO that is driven through a town. It makes calls on 1x, moves data over
// EV-DO in between, and in a connection hears several cells at a time.
class CDMAScenario final : public Scenario
{
public:
    explicit CDMAScenario(std::uint64_t seed);

    [[nodiscard]] std::string technology() const override;
    std::vector<PhoneMessage> step(std::chrono::milliseconds now) override;

private:
    using Messages = std::vector<PhoneMessage>;

    void first(Messages& messages);
    void next(Messages& messages);
    void moveData(const CDMAAir& air);
    void reportOneX(const CDMAAir& air, bool somethingChanged, Messages& messages);
    void reportEvdo(const CDMAAir& air, bool stateChanged, bool pilotsChanged, Messages& messages);
    void addStatus(const CDMAAir& air, Messages& messages);
    void addFrame(const CDMAAir& air, Messages& messages);
    void addSystem(Messages& messages) const;
    void addSummary(const CDMAAir& air, Messages& messages);
    void addActiveSet(const CDMAAir& air, Messages& messages) const;
    void addFingers(const CDMAAir& air, Messages& messages);
    void addForwardTraffic(Messages& messages) const;
    void addReverseTraffic(Messages& messages) const;
    [[nodiscard]] bool isDue(std::chrono::milliseconds every) const;
    [[nodiscard]] bool isEvdoFound() const;
    [[nodiscard]] const CDMACell& servingCell() const;
    [[nodiscard]] CDMARadio radio(const CDMAAir& air, std::uint8_t band, std::uint16_t channel);

    Drive _drive;
    CDMAPhone _phone;
    PilotSet _oneXPilots;
    PilotSet _evdoPilots;
    EvdoForwardTraffic _forward;
    EvdoReverseTraffic _reverse;
    PhoneRandom _noise;
    double _share = 0.3;                // of the sector's time
    std::chrono::milliseconds _now{-1}; // before the first step
};

} // namespace orvane
