#include "telephonyd/phone/Drive.h"

#include "telephonyd/phone/PhoneRandom.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr double kStepSeconds = 0.04;
constexpr double kMetresPerSecond = 13;
constexpr double kDecibelsPerDecade = 36;
constexpr double kNearestMetres = 40; // nobody drives up the mast

// A cell is heard from the first level on, and until it falls below the second, in dBm.
constexpr double kHeardFrom = -114;
constexpr double kHeardTo = -117;

// By how much and for how long another cell must be better.
constexpr double kBetterOnSameChannel = 3;
constexpr double kBetterOnOtherChannel = 5;
constexpr milliseconds kBetterForIdle{1280};
constexpr milliseconds kBetterForBusy{480};

double swing(double decibels, double secondsPerCycle, double phase, double seconds)
{
    return decibels * std::sin(2 * std::numbers::pi * (seconds / secondsPerCycle + phase));
}

double length(RoadPoint from, RoadPoint to)
{
    return std::hypot(to.eastMetres - from.eastMetres, to.northMetres - from.northMetres);
}

} // namespace

Drive::Drive(std::span<const DriveCell> cells, std::span<const RoadPoint> road, std::uint64_t seed)
    : _cells(cells), _road(road), _states(cells.size())
{
    PhoneRandom random(seed);
    for (CellState& state : _states)
        state.fadings = {
            {random.between(1.5, 3.0), random.between(35, 60), random.between(0, 1)},
            {random.between(1.0, 2.5), random.between(11, 19), random.between(0, 1)},
            {random.between(0.4, 1.0), random.between(2,  4),  random.between(0, 1)},
        };
    _leg = random.below(static_cast<std::uint32_t>(_road.size()));
    listen(true);
    for (std::size_t i = 0; i < _cells.size(); ++i)
        if (_states[i].level > _states[_serving].level)
            _serving = i;
}

bool Drive::step(bool isBusy)
{
    _now += kStep;
    move();
    listen(false);
    const auto better = betterCell(isBusy);
    if (!better)
        return false;
    _serving = *better;
    for (CellState& state : _states)
        state.betterFor = milliseconds(0);
    return true;
}

void Drive::move()
{
    _metresOnLeg += kMetresPerSecond * kStepSeconds;
    const double whole = length(_road[_leg], _road[(_leg + 1) % _road.size()]);
    if (_metresOnLeg < whole)
        return;
    _metresOnLeg -= whole;
    _leg = (_leg + 1) % _road.size();
}

void Drive::listen(bool isFirst)
{
    const double seconds = std::chrono::duration<double>(_now).count();
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        CellState& state = _states[i];
        double level = levelByDistance(_cells[i]);
        for (const Fading& fading : state.fadings)
            level += swing(fading.decibels, fading.secondsPerCycle, fading.phase, seconds);
        state.level = std::clamp(level, kWeakest, kStrongest);
        const double share = isFirst ? 1 : kStepSeconds;
        state.average += share * (state.level - state.average);
        state.isHeard = state.average > (state.isHeard ? kHeardTo : kHeardFrom);
    }
}

double Drive::levelByDistance(const DriveCell& cell) const
{
    const RoadPoint from = _road[_leg];
    const RoadPoint to = _road[(_leg + 1) % _road.size()];
    const double part = _metresOnLeg / std::max(length(from, to), 1.0);
    const double east = from.eastMetres + part * (to.eastMetres - from.eastMetres);
    const double north = from.northMetres + part * (to.northMetres - from.northMetres);
    const double metres =
        std::max(std::hypot(cell.eastMetres - east, cell.northMetres - north), kNearestMetres);
    return cell.levelAt100Metres - kDecibelsPerDecade * std::log10(metres / 100);
}

std::optional<std::size_t> Drive::betterCell(bool isBusy)
{
    const milliseconds needed = isBusy ? kBetterForBusy : kBetterForIdle;
    std::optional<std::size_t> best;
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        const bool sameChannel = _cells[i].channel == _cells[_serving].channel;
        const double margin = sameChannel ? kBetterOnSameChannel : kBetterOnOtherChannel;
        CellState& state = _states[i];
        if (i == _serving || !state.isHeard || state.average < _states[_serving].average + margin) {
            state.betterFor = milliseconds(0);
            continue;
        }
        state.betterFor += kStep;
        if (state.betterFor >= needed && (!best || state.average > _states[*best].average))
            best = i;
    }
    return best;
}

std::vector<std::size_t> Drive::neighbours() const
{
    std::vector<std::size_t> found;
    for (std::size_t i = 0; i < _states.size(); ++i)
        if (i != _serving && _states[i].isHeard)
            found.push_back(i);
    std::stable_sort(found.begin(), found.end(), [this](std::size_t left, std::size_t right) {
        return _states[left].average > _states[right].average;
    });
    return found;
}

std::vector<std::size_t> Drive::neighboursOn(std::uint32_t channel) const
{
    std::vector<std::size_t> found = neighbours();
    std::erase_if(found, [&](std::size_t cell) { return _cells[cell].channel != channel; });
    return found;
}

} // namespace orvane
