#include "telephonyd/modem/TechnologyProbe.h"

#include "platform/base/TelephonyConstants.h"

#include <algorithm>
#include <utility>

namespace orvane
{

TechnologyProbe::TechnologyProbe(MainQueue& queue, Watch watch)
    : _queue(queue), _watch(std::move(watch)),
      // Measurements that a modem in service logs about once a second, idle and connected.
      _candidates{
          {kTSLogChannelTechnology_Varnel_LTE,    {0xB179, 0xB17F}},
          {kTSLogChannelTechnology_Varnel_GSM,    {0x4005, 0x5137}},
          {kTSLogChannelTechnology_Varnel_UTRAN2, {0xD00A, 0xD00C}},
          {kTSLogChannelTechnology_Varnel_CDMA,   {0x1183, 0x119C}},
}
{
}

void TechnologyProbe::start(const std::string& firstTechnology)
{
    if (std::exchange(_isRunning, true))
        return;
    const auto first =
        std::find_if(_candidates.begin(), _candidates.end(),
                     [&](const Candidate& each) { return each.technology == firstTechnology; });
    if (first != _candidates.end())
        std::rotate(_candidates.begin(), first, first + 1);
    _current = 0;
    _rounds = 0;
    beginTurn();
}

void TechnologyProbe::stop()
{
    if (!std::exchange(_isRunning, false))
        return;
    ++_turn;
    _isWatching = false;
    _watch({});
}

void TechnologyProbe::settled()
{
    if (!_isRunning || std::exchange(_isWatching, true))
        return;
    _queue.after(kTurn, _lifetime.whileAlive([this, turn = _turn] {
        if (turn == _turn)
            endTurn();
    }));
}

bool TechnologyProbe::isShownBy(std::uint16_t code) const
{
    // An item that comes before the codes are switched on is of an earlier program.
    return _isWatching && _candidates[_current].codes.contains(code);
}

std::string TechnologyProbe::technology() const
{
    return _isRunning ? _candidates[_current].technology : "";
}

void TechnologyProbe::beginTurn()
{
    ++_turn;
    _isWatching = false;
    _watch(_candidates[_current].codes);
}

void TechnologyProbe::endTurn()
{
    if (++_current == _candidates.size()) {
        _current = 0;
        ++_rounds;
    }
    beginTurn();
}

} // namespace orvane
