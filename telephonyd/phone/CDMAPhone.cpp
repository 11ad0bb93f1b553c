#include "telephonyd/phone/CDMAPhone.h"

#include <algorithm>
#include <span>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr Phases::Range kCallFor{14, 32};
constexpr Phases::Range kNoCallFor{25, 50};
constexpr Phases::Range kDataFor{8, 22};
constexpr Phases::Range kNoDataFor{4, 11};

constexpr milliseconds kAccessTakes{400};
// In slotted mode the phone wakes up for its slot of the paging channel.
constexpr milliseconds kSlotEvery{5120};
constexpr milliseconds kAwakeFor{1280};

// One state after the other.
template <typename State>
struct Stage {
    State state;
    milliseconds until; // from the beginning of the first
};

constexpr Stage<OneXState> kOneXSearch[] = {
    {OneXState::Starting,    milliseconds(160) },
    {OneXState::Acquisition, milliseconds(520) },
    {OneXState::Sync,        milliseconds(880) },
    {OneXState::Slew,        milliseconds(1000)},
    {OneXState::Paging,      milliseconds(4000)}, // for answers, before sleep
};
constexpr milliseconds kEvdoSearchTakes{1800};
constexpr Stage<EvdoState> kEvdoSearch[] = {
    {EvdoState::Acquisition, milliseconds(1400)}, // once 1x is found
    {EvdoState::Sync,        kEvdoSearchTakes  },
};
constexpr Stage<EvdoSession> kNegotiation[] = {
    {EvdoSession::Closed,            milliseconds(240) },
    {EvdoSession::AddressSetup,      milliseconds(720) },
    {EvdoSession::PhoneNegotiates,   milliseconds(1400)},
    {EvdoSession::NetworkNegotiates, milliseconds(1800)},
};

template <typename State>
State stageAt(std::span<const Stage<State>> stages, milliseconds passed, State afterAll)
{
    for (const Stage<State>& stage : stages)
        if (passed < stage.until)
            return stage.state;
    return afterAll;
}

} // namespace

CDMAPhone::CDMAPhone(std::uint64_t seed)
    : _call(kCallFor, kNoCallFor, false, seed), _data(kDataFor, kNoDataFor, true, seed + 1),
      _random(seed + 2)
{
}

void CDMAPhone::advance(milliseconds now, std::uint8_t colourCode)
{
    if (_call.advance(now) && !_call.isOn())
        endCall(now);
    if (_data.advance(now) && _data.isOn())
        _dataSince = now;
    _oneX = oneXAt(now);
    _evdo = evdoAt(now);
    if (_evdo >= EvdoState::Idle && colourCode != _colourCode)
        joinSubnet(colourCode, now);
    if (_evdo >= EvdoState::Idle)
        _session = sessionAt(now);
}

void CDMAPhone::endCall(milliseconds now)
{
    _outOfCallSince = now;
    // A negotiation that the call interrupted starts again when EV-DO is back.
    if (_session != EvdoSession::Open)
        _subnetSince = now + kEvdoSearchTakes;
}

OneXState CDMAPhone::oneXAt(milliseconds now) const
{
    if (_call.isOn())
        return OneXState::Traffic;
    const bool isSlot = now % kSlotEvery < kAwakeFor;
    return stageAt<OneXState>(kOneXSearch, now - _outOfCallSince,
                              isSlot ? OneXState::Paging : OneXState::Sleep);
}

EvdoState CDMAPhone::evdoAt(milliseconds now) const
{
    if (_call.isOn())
        return EvdoState::Inactive;
    const milliseconds passed = now - _outOfCallSince;
    const EvdoState found = stageAt<EvdoState>(kEvdoSearch, passed, EvdoState::Idle);
    const bool isNegotiating = sessionAt(now) != EvdoSession::Open;
    if (found != EvdoState::Idle || !(_data.isOn() || isNegotiating))
        return found;
    const milliseconds wanted =
        std::max(_data.isOn() ? _dataSince : _subnetSince, _outOfCallSince + kEvdoSearchTakes);
    return now - wanted < kAccessTakes ? EvdoState::Access : EvdoState::Connected;
}

EvdoSession CDMAPhone::sessionAt(milliseconds now) const
{
    return stageAt<EvdoSession>(kNegotiation, now - _subnetSince, EvdoSession::Open);
}

void CDMAPhone::joinSubnet(std::uint8_t colourCode, milliseconds now)
{
    const bool isFirst = _colourCode == 0; // the session that the phone began with
    _colourCode = colourCode;
    _terminalId = _random.below(1U << 24);
    if (!isFirst)
        _subnetSince = now;
}

} // namespace orvane
