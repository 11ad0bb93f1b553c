#include "telephonyd/phone/LTEScenario.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "telephonyd/phone/ServerItems.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr milliseconds kConnectedMeasurementEvery{240};
constexpr milliseconds kServingMeasurementEvery{640};
constexpr milliseconds kNeighboursEvery{1280};
constexpr milliseconds kReselectionEvery{5120};
constexpr milliseconds kCellsEvery{1000};

constexpr Phases::Range kConnectedFor{12, 30};
constexpr Phases::Range kIdleFor{15, 35};
constexpr Phases::Range kDataFor{50, 110};
constexpr Phases::Range kNoDataFor{8, 20};

constexpr double kBestQuality = -6;
constexpr double kWorstQuality = -17;

double milliwatts(double decibelMilliwatts) { return std::pow(10, decibelMilliwatts / 10); }

// The share of a channel that is in use besides its pilots. It rises and falls with the traffic.
double shareInUse(std::uint16_t earfcn, milliseconds now)
{
    constexpr double kMean = 0.45;
    constexpr double kSwing = 0.1;
    constexpr double kSecondsPerCycle = 23;
    const double seconds = std::chrono::duration<double>(now).count() + earfcn;
    return kMean + kSwing * std::sin(2 * std::numbers::pi * seconds / kSecondsPerCycle);
}

// The quality that a cell of that power has among the powers of all on its channel, its own
// included. Receivers tell bad qualities apart less and less: they come close to kWorstQuality but
// not to it.
double quality(double power, double allMilliwatts, double share)
{
    constexpr double kCarriers = 12;
    constexpr double kNoise = -127; // dBm a carrier
    constexpr double kBadQuality = -12;
    const double total = kCarriers * (share * allMilliwatts + milliwatts(kNoise));
    const double plain = 10 * std::log10(milliwatts(power) / total);
    if (plain > kBadQuality)
        return std::min(plain, kBestQuality);
    constexpr double kRest = kBadQuality - kWorstQuality;
    return kWorstQuality + kRest * std::exp((plain - kBadQuality) / kRest);
}

std::uint16_t frames(milliseconds now, int millisecondsPerFrame, int modulus)
{
    return static_cast<std::uint16_t>(now.count() / millisecondsPerFrame % modulus);
}

PropertyValue listed(const LTECell& cell, bool isServing)
{
    return listedCell(kTSCellMonitorRadioAccessTechnologyLTE, isServing,
                      {
                          {kTSCellMonitorTAC,      cell.trackingAreaCode},
                          {kTSCellMonitorCellId,   cell.cellIdentity    },
                          {kTSCellMonitorPID,      cell.physicalCellId  },
                          {kTSCellMonitorBandInfo, cell.band            },
                          {kTSCellMonitorUARFCN,   cell.earfcn          },
    });
}

} // namespace

LTEScenario::LTEScenario(std::uint64_t seed)
    : DrivenScenario(kTSLogChannelTechnology_Varnel_LTE, {kLTETownMasts, kLTETownRoad, seed}),
      _connected(kConnectedFor, kIdleFor, false, seed + 1),
      _dataConnections(DataConnections::Network::LTE, kDataFor, kNoDataFor, seed + 2)
{
}

void LTEScenario::first()
{
    addServingCell();
    add(serverItem(kSimFilesItem, simFiles()));
    addCells();
    add(_dataConnections.item());
    addServingMeasurement(true);
    addNeighbours();
    addConnectedMeasurement();
    addReselection();
}

void LTEScenario::next()
{
    _connected.advance(now());
    if (_dataConnections.advance(now()))
        add(_dataConnections.item());
    const bool cellChanged = _drive.step(_connected.isOn());
    if (cellChanged)
        addServingCell();
    if (cellChanged || isDue(kCellsEvery))
        addCells();
    if (_connected.isOn()) {
        if (isDue(kConnectedMeasurementEvery))
            addConnectedMeasurement();
        return;
    }
    if (cellChanged || isDue(kServingMeasurementEvery))
        addServingMeasurement(cellChanged);
    if (cellChanged || isDue(kNeighboursEvery))
        addNeighbours();
    if (isDue(kReselectionEvery))
        addReselection();
}

LTELevels LTEScenario::levels(std::size_t cell) const
{
    const LTECell& own = kLTETown[cell];
    double all = 0;
    double averageAll = 0;
    for (std::size_t i = 0; i < kLTETown.size(); ++i)
        if (kLTETown[i].earfcn == own.earfcn) {
            all += milliwatts(_drive.level(i));
            averageAll += milliwatts(_drive.averageLevel(i));
        }
    const double power = _drive.level(cell);
    const double share = shareInUse(own.earfcn, now());
    const double powerQuality = quality(power, all, share);
    return {own,
            power,
            _drive.averageLevel(cell),
            powerQuality,
            quality(_drive.averageLevel(cell), averageAll, share),
            power - powerQuality + 10 * std::log10(own.resourceBlocks)};
}

std::vector<LTELevels> LTEScenario::levelsOf(const std::vector<std::size_t>& cells) const
{
    std::vector<LTELevels> found;
    for (const std::size_t cell : cells)
        found.push_back(levels(cell));
    return found;
}

void LTEScenario::addServingCell()
{
    const LTECell& cell = kLTETown[_drive.serving()];
    add(lteServingCell(cell));
    add(lteMasterInformation(cell, frames(now(), 10, 1024)));
}

void LTEScenario::addServingMeasurement(bool rulesUpdated)
{
    add(lteServingMeasurement(levels(_drive.serving()), rulesUpdated));
}

void LTEScenario::addConnectedMeasurement()
{
    const std::size_t serving = _drive.serving();
    const auto others = levelsOf(_drive.neighboursOn(kLTETown[serving].earfcn));
    add(lteConnectedMeasurement(levels(serving), others, frames(now(), 1, 10240)));
}

// The neighbours on the serving channel, or where none is heard those on the channel of the
// strongest: a report is of one channel and of at least one cell.
void LTEScenario::addNeighbours()
{
    const std::vector<std::size_t> all = _drive.neighbours();
    if (all.empty())
        return;
    auto cells = _drive.neighboursOn(kLTETown[_drive.serving()].earfcn);
    if (cells.empty())
        cells = _drive.neighboursOn(kLTETown[all.front()].earfcn);
    add(lteNeighbourMeasurement(levelsOf(cells), frames(now(), 10, 1024)));
}

// LTE and the other technologies by turns.
void LTEScenario::addReselection()
{
    const LTECell& serving = kLTETown[_drive.serving()];
    const std::vector<std::size_t> neighbours = _drive.neighbours();
    const unsigned turn = _reselections++;
    const bool isLte = turn % 2 == 0 && !neighbours.empty();
    add(lteReselection(serving, isLte ? lteCandidate(kLTETown[neighbours.front()])
                                      : otherCandidate(turn / 2)));
}

void LTEScenario::addCells()
{
    add(cellList(_drive.serving(), _drive.neighbours(), [](std::size_t cell, bool isServing) {
        return listed(kLTETown[cell], isServing);
    }));
}

} // namespace orvane
