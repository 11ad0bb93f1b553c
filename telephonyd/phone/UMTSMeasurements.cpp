// What the phone of UMTSScenario hears.

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "telephonyd/phone/ServerItems.h"
#include "telephonyd/phone/UMTSScenario.h"

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

constexpr double kActiveWithin = 6; // of the serving cell
constexpr double kMonitoredWithin = 14;
constexpr std::size_t kMostActive = 3;

double milliwatts(double decibelMilliwatts) { return std::pow(10, decibelMilliwatts / 10); }

} // namespace

std::size_t UMTSScenario::bestOf(bool isUmts) const
{
    if (serving().isUmts == isUmts)
        return _drive.serving();
    std::size_t best = kUMTSTown.size();
    for (std::size_t i = 0; i < kUMTSTown.size(); ++i)
        if (kUMTSTown[i].isUmts == isUmts &&
            (best == kUMTSTown.size() || _drive.averageLevel(i) > _drive.averageLevel(best)))
            best = i;
    return best;
}

// Those that a receiver can make out: by power in GSM, above the other cells' noise in UMTS.
std::vector<std::size_t> UMTSScenario::othersOf(bool isUmts) const
{
    constexpr double kLeastPower = -110;
    constexpr double kLeastQuality = -20;
    std::vector<std::size_t> found = _drive.neighbours();
    std::erase_if(found, [&](std::size_t cell) {
        return kUMTSTown[cell].isUmts != isUmts ||
               (isUmts ? quality(cell) < kLeastQuality : _drive.level(cell) < kLeastPower);
    });
    return found;
}

// All cells on the channel with their traffic, and the receiver's noise.
double UMTSScenario::totalPower(std::uint16_t channel) const
{
    constexpr double kAllOverPilot = 2.5;
    constexpr double kNoise = -101;
    double sum = milliwatts(kNoise);
    for (std::size_t i = 0; i < kUMTSTown.size(); ++i)
        if (kUMTSTown[i].isUmts && kUMTSTown[i].channel == channel)
            sum += kAllOverPilot * milliwatts(_drive.level(i));
    return 10 * std::log10(sum);
}

double UMTSScenario::quality(std::size_t cell) const
{
    constexpr double kWorst = -24;
    return std::max(_drive.level(cell) - totalPower(kUMTSTown[cell].channel), kWorst);
}

UMTSLevel UMTSScenario::umtsLevel(std::size_t cell) const
{
    using enum UMTSLevel::Set;
    constexpr double kHysteresis = 4;
    const double power = _drive.averageLevel(cell);
    const double below = _drive.averageLevel(bestOf(true)) - power;
    const bool isServing = cell == _drive.serving();
    return {kUMTSTown[cell], _drive.level(cell), quality(cell),
            isServing ? power + kHysteresis : power,
            below <= kMonitoredWithin ? Monitored : Detected};
}

// In a call the strongest cells on the channel serve the phone together.
void UMTSScenario::addActiveSet()
{
    const std::size_t best = bestOf(true);
    const std::uint16_t channel = kUMTSTown[best].channel;
    std::vector<UMTSLevel> cells = {umtsLevel(best)};
    cells.front().set = UMTSLevel::Set::Active;
    std::size_t active = 1;
    for (const std::size_t cell : othersOf(true)) {
        if (cell == best || kUMTSTown[cell].channel != channel)
            continue;
        UMTSLevel level = umtsLevel(cell);
        const bool isClose = _drive.averageLevel(cell) > _drive.averageLevel(best) - kActiveWithin;
        if (_umts.state() == RadioState::CellDch && isClose && active < kMostActive) {
            level.set = UMTSLevel::Set::Active;
            ++active;
        }
        cells.push_back(level);
    }
    add(umtsActiveSet(totalPower(channel), cells));
}

void UMTSScenario::addUMTSRanking()
{
    std::vector<UMTSLevel> cells = {umtsLevel(bestOf(true))};
    for (const std::size_t cell : othersOf(true))
        if (cell != bestOf(true))
            cells.push_back(umtsLevel(cell));
    std::stable_sort(cells.begin(), cells.end(), [](const UMTSLevel& left, const UMTSLevel& right) {
        return left.rank > right.rank;
    });
    add(umtsRanking(cells));
}

// The weaker a cell comes in, the stronger the phone has to send.
void UMTSScenario::addTransmitPower()
{
    constexpr double kLoss = -96; // dBm, of both powers together
    constexpr double kWeakest = -50;
    constexpr double kStrongest = 24;
    std::vector<double> powers(4);
    for (double& power : powers)
        power = std::clamp(kLoss - _drive.level(bestOf(true)) + _noise.between(-1.5, 1.5), kWeakest,
                           kStrongest);
    add(umtsTransmitPower(powers));
}

void UMTSScenario::addBlockErrors()
{
    constexpr std::uint32_t kSpeechBlocks = 48; // in the time between two reports
    constexpr std::uint32_t kSignallingBlocks = 24;
    const double share = 0.01 * std::exp(std::max(-quality(bestOf(true)) - 8, 0.0) / 3);
    for (TransportBlocks& each : _blocks) {
        const bool isSignalling = &each == &_blocks.back();
        if (!isSignalling && _use == Use::Data)
            continue;
        const std::uint32_t blocks = isSignalling ? kSignallingBlocks : kSpeechBlocks;
        each.received += blocks;
        for (std::uint32_t i = 0; i < blocks; ++i)
            each.damaged += _noise.between(0, 1) < share ? 1 : 0;
    }
    add(umtsBlockErrors(_blocks));
}

// Where the cell comes in well, a second carrier helps.
void UMTSScenario::addFastDownlink()
{
    constexpr std::uint16_t kSubFrames = 240;
    constexpr std::uint8_t kProcesses = 6;
    constexpr double kWellQuality = -8;
    const double ratio = quality(bestOf(true));
    // Bits of a block by how well it comes in, and blocks of a process in the time.
    const double blockBits = 14400 * std::pow(10, std::max((ratio + 4) / 12, -1.2));
    const auto processes = [&] {
        std::vector<DownlinkProcess> found;
        for (std::uint8_t i = 0; i < kProcesses; ++i) {
            const auto transmissions =
                static_cast<std::uint16_t>(kSubFrames / kProcesses - _noise.below(12));
            const auto errors =
                static_cast<std::uint16_t>(transmissions * _noise.between(0.03, 0.15));
            const double bits = blockBits * _noise.between(0.9, 1) * (transmissions - errors);
            found.push_back({i, static_cast<std::uint32_t>(bits), transmissions, errors});
        }
        return found;
    };
    const auto primary = processes();
    const bool isFirst = now().count() == 0;
    const auto secondary =
        isFirst || ratio > kWellQuality ? processes() : std::vector<DownlinkProcess>();
    add(umtsFastDownlink(kSubFrames, primary, secondary));
}

std::vector<GSMLevel> UMTSScenario::gsmNeighbours() const
{
    constexpr std::size_t kMostMeasured = 6;
    std::vector<GSMLevel> found;
    for (const std::size_t cell : othersOf(false))
        if (found.size() < kMostMeasured)
            found.push_back({kUMTSTown[cell], _drive.level(cell)});
    return found;
}

void UMTSScenario::addGSMMeasurement()
{
    const std::size_t best = bestOf(false);
    add(gsmMeasurement({kUMTSTown[best], _drive.level(best)}, gsmNeighbours()));
}

void UMTSScenario::addGSMColours() { add(gsmColours(gsmNeighbours())); }

void UMTSScenario::addGSMRanking()
{
    const std::size_t best = bestOf(false);
    std::vector<GSMLevel> cells = {
        {kUMTSTown[best], _drive.level(best)}
    };
    for (const GSMLevel& each : gsmNeighbours())
        cells.push_back(each);
    add(gsmRanking(cells));
}

// The server reports half of a GSM cell's level.
PropertyValue UMTSScenario::listed(std::size_t index, bool isServing) const
{
    const UMTSTownCell& cell = kUMTSTown[index];
    const double level = _drive.level(index);
    if (!cell.isUmts)
        return listedCell(kTSCellMonitorRadioAccessTechnologyGSM, isServing,
                          {
                              {kTSCellMonitorLAC,    cell.locationArea},
                              {kTSCellMonitorCellId, cell.cellIdentity},
                              {kTSCellMonitorARFCN,  cell.channel     },
                              {kTSCellMonitorRSSI,   level / 2        },
        });
    return listedCell(kTSCellMonitorRadioAccessTechnologyUMTS, isServing,
                      {
                          {kTSCellMonitorLAC,    cell.locationArea},
                          {kTSCellMonitorCellId, cell.cellIdentity},
                          {kTSCellMonitorUARFCN, cell.channel     },
                          {kTSCellMonitorSCN,    cell.code        },
                          {kTSCellMonitorRSCP,   level            },
                          {kTSCellMonitorECN0,   quality(index)   },
    });
}

void UMTSScenario::addCells()
{
    std::vector<std::size_t> others = othersOf(serving().isUmts);
    for (const std::size_t cell : othersOf(!serving().isUmts))
        others.push_back(cell);
    add(cellList(_drive.serving(), others,
                 [this](std::size_t cell, bool isServing) { return listed(cell, isServing); }));
}

} // namespace orvane
