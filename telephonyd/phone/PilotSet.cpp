#include "telephonyd/phone/PilotSet.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr std::chrono::milliseconds kWeakForAtMost{2000};

} // namespace

bool PilotSet::step(const CDMAAir& air, std::size_t serving, bool isConnected)
{
    const std::vector<std::size_t> before = _cells;
    if (isConnected)
        std::erase_if(_cells,
                      [&](std::size_t cell) { return cell != serving && !isKept(air, cell); });
    else
        _cells.clear();
    const auto add = [this](std::size_t cell) {
        if (std::find(_cells.begin(), _cells.end(), cell) != _cells.end())
            return;
        _cells.push_back(cell);
        _weakFor[cell] = {};
    };
    add(serving);
    for (std::size_t cell = 0; isConnected && cell < kCDMATownCells; ++cell)
        if (_cells.size() < kMostCells && air.isOnCarrier(cell) &&
            (air.*_strength)(cell) >= _comesInAt)
            add(cell);
    return _cells != before;
}

bool PilotSet::isKept(const CDMAAir& air, std::size_t cell)
{
    if (!air.isOnCarrier(cell))
        return false;
    if ((air.*_strength)(cell) >= _goesOutBelow)
        _weakFor[cell] = {};
    else
        _weakFor[cell] += Drive::kStep;
    return _weakFor[cell] < kWeakForAtMost;
}

} // namespace orvane
