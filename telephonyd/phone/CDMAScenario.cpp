#include "telephonyd/phone/CDMAScenario.h"

#include "platform/base/Calendar.h"
#include "platform/base/TelephonyConstants.h"
#include "telephonyd/phone/EvdoPackets.h"
#include "telephonyd/phone/LTETown.h"
#include "telephonyd/phone/OneXPackets.h"

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr milliseconds kStatusEvery{1000};
constexpr milliseconds kFrameEvery{200};
constexpr milliseconds kSystemEvery{10000};
constexpr milliseconds kSummaryEvery{1000};
constexpr milliseconds kActiveSetEvery{1000};
constexpr milliseconds kFingersEvery{480};
constexpr milliseconds kForwardTrafficEvery{1000};
constexpr milliseconds kReverseTrafficEvery{2000};

constexpr double kMostSent = 23.5; // dBm
constexpr double kLeastSent = -50;

constexpr double kUpperBandLoss = 6; // dB more on the way at 1.9 GHz
constexpr bool isUpperBand(std::uint8_t band) { return band == 1; }

double received(const CDMAAir& air, std::uint8_t band)
{
    return air.received() - (isUpperBand(band) ? kUpperBandLoss : 0);
}

// The less a phone hears, the more it takes for the cell to hear it: so they add up to a constant.
double sent(const CDMAAir& air, std::uint8_t band)
{
    const double openLoop = isUpperBand(band) ? -76 : -73;
    return std::clamp(openLoop - received(air, band), kLeastSent, kMostSent);
}

// How likely a frame of voice is damaged where the best pilot has that strength: power control
// keeps it low as long as it can.
double damagedFrames(double pilot) { return 0.008 + 0.2 / (1 + std::exp((pilot + 12.5) * 1.6)); }

std::uint32_t wholeSeconds(milliseconds now)
{
    return static_cast<std::uint32_t>(
        std::chrono::duration_cast<std::chrono::seconds>(now).count());
}

} // namespace

CDMAScenario::CDMAScenario(std::uint64_t seed)
    : DrivenScenario(kTSLogChannelTechnology_Varnel_CDMA, {kCDMATownMasts, kLTETownRoad, seed}),
      _phone(seed + 1), _oneXPilots(&CDMAAir::oneXPilot, -14, -16),
      _evdoPilots(&CDMAAir::evdoPilot, -9, -11), _forward(seed + 4), _reverse(seed + 5),
      _noise(seed + 6)
{
}

// The frame is the last of the call before.
void CDMAScenario::first()
{
    _phone.advance(now(), servingCell().area.colourCode);
    const CDMAAir air(_drive);
    _oneXPilots.step(air, _drive.serving(), _phone.isInTraffic());
    _evdoPilots.step(air, _drive.serving(), _phone.isConnected());
    addSystem();
    addFrame(air);
    addStatus(air);
    addSummary(air);
    addActiveSet(air);
    addFingers(air);
    addForwardTraffic();
    addReverseTraffic();
}

void CDMAScenario::next()
{
    const OneXState oneXBefore = _phone.oneX();
    const EvdoState evdoBefore = _phone.evdo();
    const EvdoSession sessionBefore = _phone.session();
    const bool cellChanged = _drive.step(_phone.isInTraffic() || _phone.isConnected());
    _phone.advance(now(), servingCell().area.colourCode);
    const CDMAAir air(_drive);
    const bool oneXPilotsChanged =
        _oneXPilots.step(air, _drive.serving(), _phone.isInTraffic()) && _phone.isInTraffic();
    const bool evdoPilotsChanged =
        _evdoPilots.step(air, _drive.serving(), _phone.isConnected()) && isEvdoFound();
    moveData(air);

    if (cellChanged || isDue(kSystemEvery))
        addSystem();
    reportOneX(air, _phone.oneX() != oneXBefore || oneXPilotsChanged);
    reportEvdo(air, _phone.evdo() != evdoBefore || _phone.session() != sessionBefore,
               evdoPilotsChanged);
}

// How much of the sector's time is the phone's changes every second or so, as others come and go.
void CDMAScenario::moveData(const CDMAAir& air)
{
    constexpr milliseconds kShareFor{1200};
    if (isDue(kShareFor))
        _share = _noise.between(0.12, 0.55);
    if (!_phone.isConnected())
        return;
    _forward.step(air.carrierToInterference(_drive.serving()), _share);
    _reverse.step(kMostSent - sent(air, servingCell().area.evdoBand));
}

void CDMAScenario::reportOneX(const CDMAAir& air, bool somethingChanged)
{
    // Asleep there is nothing to report but that.
    const bool isDueAwake = isDue(kStatusEvery) && _phone.oneX() != OneXState::Sleep;
    if (somethingChanged || isDueAwake)
        addStatus(air);
    if (_phone.isInTraffic() && isDue(kFrameEvery))
        addFrame(air);
}

void CDMAScenario::reportEvdo(const CDMAAir& air, bool stateChanged, bool pilotsChanged)
{
    if (stateChanged || isDue(kSummaryEvery))
        addSummary(air);
    if (stateChanged || pilotsChanged || isDue(kActiveSetEvery))
        addActiveSet(air);
    if (stateChanged || isDue(kFingersEvery))
        addFingers(air);
    if (isDue(kForwardTrafficEvery))
        addForwardTraffic();
    if (isDue(kReverseTrafficEvery))
        addReverseTraffic();
}

bool CDMAScenario::isEvdoFound() const { return _phone.evdo() >= EvdoState::Sync; }

const CDMACell& CDMAScenario::servingCell() const { return kCDMATown[_drive.serving()]; }

// The second receiver's antenna is the worse one.
CDMARadio CDMAScenario::radio(const CDMAAir& air, std::uint8_t band, std::uint16_t channel)
{
    const double level = received(air, band);
    return {band, channel, level, level - _noise.between(1.5, 4.5),
            sent(air, band) + _noise.between(-1, 1)};
}

void CDMAScenario::addStatus(const CDMAAir& air)
{
    std::vector<CDMAPilot> pilots;
    for (const std::size_t cell : _oneXPilots.cells())
        pilots.push_back({kCDMATown[cell].pilotOffset, air.oneXPilot(cell)});
    const CDMAArea& area = servingCell().area;
    add(oneXStatus(_phone.oneX(), radio(air, area.oneXBand, area.oneXChannel), pilots,
                   servingCell().pilotOffset));
}

void CDMAScenario::addFrame(const CDMAAir& air)
{
    add(oneXFrame(_noise.between(0, 1) < damagedFrames(air.oneXPilot(_drive.serving()))));
}

void CDMAScenario::addSystem() { add(oneXSystem(servingCell())); }

void CDMAScenario::addSummary(const CDMAAir& air)
{
    const CDMAArea& area = servingCell().area;
    std::optional<std::uint16_t> serving;
    if (isEvdoFound())
        serving = servingCell().pilotOffset;
    add(evdoSummary(_phone, radio(air, area.evdoBand, area.evdoChannel), serving));
}

void CDMAScenario::addActiveSet(const CDMAAir& air)
{
    std::vector<CDMAPilot> pilots;
    if (isEvdoFound())
        for (const std::size_t cell : _evdoPilots.cells())
            pilots.push_back({kCDMATown[cell].pilotOffset, air.evdoPilot(cell)});
    add(evdoActiveSet(pilots));
}

// Two echoes of the serving cell, one of each other in the active set, the rest at rest.
void CDMAScenario::addFingers(const CDMAAir& air)
{
    constexpr std::size_t kFingers = 6;
    constexpr double kOfFirst = -1.5; // dB of a cell's strength that is in its first echo
    std::vector<std::optional<CDMAPilot>> fingers;
    const auto lock = [&](std::size_t cell, double weaker) {
        fingers.push_back(
            CDMAPilot{kCDMATown[cell].pilotOffset, air.carrierToInterference(cell) + weaker});
    };
    if (isEvdoFound()) {
        lock(_drive.serving(), kOfFirst);
        lock(_drive.serving(), kOfFirst - _noise.between(4, 8));
        for (const std::size_t cell : _evdoPilots.cells())
            if (cell != _drive.serving())
                lock(cell, kOfFirst);
    }
    fingers.resize(kFingers);
    add(evdoFingers(fingers));
}

void CDMAScenario::addForwardTraffic() { add(evdoForwardTraffic(wholeSeconds(now()), _forward)); }

void CDMAScenario::addReverseTraffic() { add(evdoReverseTraffic(wholeSeconds(now()), _reverse)); }

} // namespace orvane
