#include "telephonyd/phone/UTRANScenario.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "telephonyd/phone/LTETown.h"
#include "telephonyd/phone/ServerItems.h"
#include "telephonyd/phone/UTRANPackets.h"

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr milliseconds kConnectedMeasurementEvery{480};
constexpr milliseconds kIdleMeasurementEvery{1280};
constexpr milliseconds kGSMMeasurementEvery{2560};
constexpr milliseconds kCellsEvery{1000};
constexpr milliseconds kRegistrationTakes{1800};

constexpr Phases::Range kDataFor{25, 60};
constexpr Phases::Range kNoDataFor{6, 14};

// How far below the serving cell another may be on the same channel and still be monitored, and
// still be worth detecting jointly.
constexpr double kMonitoredWithin = 28;
constexpr double kJointWithin = 12;

bool isOnOwnChannels(RadioState state) { return state == RadioState::CellDch; }
bool isReceiving(RadioState state)
{
    return state == RadioState::CellDch || state == RadioState::CellFach;
}

// What a time slot is like where the cell has that power.
double signalToInterference(double power) { return std::clamp((power + 114) * 0.55, 1.0, 24.0); }
double percentDamaged(double ratio) { return std::min(12 * std::exp((4 - ratio) / 3), 60.0); }

PropertyValue listed(const UTRANCell& cell, bool isServing, double power)
{
    return listedCell(kTSCellMonitorRadioAccessTechnologyUTRAN2, isServing,
                      {
                          {kTSCellMonitorLAC,      cell.locationArea },
                          {kTSCellMonitorCellId,   cell.cellIdentity },
                          {kTSCellMonitorBandInfo, cell.band         },
                          {kTSCellMonitorSCN,      cell.cellParameter},
                          {kTSCellMonitorUARFCN,   cell.channel      },
                          {kTSCellMonitorRSCP,     power             },
    });
}

} // namespace

UTRANScenario::UTRANScenario(std::uint64_t seed)
    : DrivenScenario(kTSLogChannelTechnology_Varnel_UTRAN2, {kUTRANTownMasts, kLTETownRoad, seed}),
      _radio(seed + 1),
      _dataConnections(DataConnections::Network::BeforeLTE, kDataFor, kNoDataFor, seed + 2),
      _noise(seed + 3)
{
}

void UTRANScenario::first()
{
    _locationArea = kUTRANTown[_drive.serving()].locationArea;
    add(utranRadioState(_radio.state()));
    addServingCell();
    add(serverItem(kSimFilesItem, simFiles()));
    addCells();
    add(_dataConnections.item());
    addNeighbours();
    addGSMNeighbours();
    addChannelQuality();
}

void UTRANScenario::next()
{
    if (_radio.advance(now()))
        add(utranRadioState(_radio.state()));
    if (_dataConnections.advance(now()))
        add(_dataConnections.item());
    const bool cellChanged = _drive.step(isOnOwnChannels(_radio.state()));
    if (cellChanged)
        changeCell();
    if (_isRegistering && now() >= _registeredAt) {
        _isRegistering = false;
        addServingCell();
    }
    if (cellChanged || isDue(kCellsEvery))
        addCells();
    const milliseconds every =
        isReceiving(_radio.state()) ? kConnectedMeasurementEvery : kIdleMeasurementEvery;
    if (cellChanged || isDue(every)) {
        addNeighbours();
        addChannelQuality();
    }
    if (isDue(kGSMMeasurementEvery))
        addGSMNeighbours();
}

void UTRANScenario::changeCell()
{
    const std::uint16_t area = kUTRANTown[_drive.serving()].locationArea;
    if (area != _locationArea) {
        _locationArea = area;
        _isRegistering = true;
        _registeredAt = now() + kRegistrationTakes;
    }
    addServingCell();
}

// Until the network has taken the phone in, it lets it make emergency calls only.
void UTRANScenario::addServingCell()
{
    add(utranServingCell(kUTRANTown[_drive.serving()], _isRegistering));
}

void UTRANScenario::addNeighbours()
{
    const std::size_t serving = _drive.serving();
    const double best = _drive.averageLevel(serving);
    const auto record = [this](std::size_t cell, UTRANSet set, bool isJoint) {
        return UTRANNeighbour{kUTRANTown[cell].channel, kUTRANTown[cell].cellParameter,
                              _drive.averageLevel(cell), set, isJoint};
    };
    std::vector<UTRANNeighbour> cells;
    if (isReceiving(_radio.state()))
        cells.push_back(record(serving, UTRANSet::Active, true));
    for (const std::size_t cell : _drive.neighbours()) {
        const double power = _drive.averageLevel(cell);
        const bool sharesChannel = kUTRANTown[cell].channel == kUTRANTown[serving].channel;
        const bool isMonitored = sharesChannel && power > best - kMonitoredWithin;
        cells.push_back(record(cell, isMonitored ? UTRANSet::Monitored : UTRANSet::Detected,
                               sharesChannel && power > best - kJointWithin));
    }
    add(utranNeighbours(cells));
}

// GSM transceivers share some of the masts.
void UTRANScenario::addGSMNeighbours()
{
    constexpr double kGSMStronger = 6;
    constexpr std::uint16_t kFirstChannel = 22;
    std::vector<UTRANGSMNeighbour> cells;
    for (const std::size_t cell : _drive.neighbours())
        if (cell % 2 == 0)
            cells.push_back({static_cast<std::uint16_t>(kUTRANTown[cell].cellIdentity & 0x3FFF),
                             static_cast<std::uint16_t>(kFirstChannel + 3 * cell),
                             static_cast<std::uint8_t>(8 * (cell % 4) + cell % 8),
                             _drive.averageLevel(cell) + kGSMStronger});
    add(utranGSMNeighbours(cells));
}

// What there is to be measured goes by the state: the paging channel, the shared channels, or those
// of a call and of a data transfer by turns.
void UTRANScenario::addChannelQuality()
{
    constexpr std::uint8_t kBroadcastSlot = 0;
    const double ratio = signalToInterference(_drive.level(_drive.serving()));
    std::vector<TransportChannel> transport;
    std::vector<CodedChannel> coded;
    const auto addTransport = [&](std::uint8_t number, double more) {
        transport.push_back({number, percentDamaged(ratio) + _noise.between(0, more)});
    };
    const auto addCoded = [&](std::uint8_t number, std::uint8_t slot, double more) {
        CodedChannel channel{number, slot, {}};
        for (double& each : channel.signalsToInterference)
            each = ratio + more + _noise.between(-1.5, 1.5);
        coded.push_back(channel);
    };
    switch (_radio.state()) {
    case RadioState::CellDch:
        addCoded(1, 5, 0);
        addTransport(1, 2);
        if (_radio.transfers() % 2 == 1) {
            addTransport(2, 2);
            addTransport(3, 3);
            addTransport(31, 1);
        } else {
            addTransport(31, 1);
            addCoded(2, 6, -1);
        }
        break;
    case RadioState::CellFach:
        addCoded(1, 4, 0);
        addTransport(1, 2);
        addTransport(2, 2);
        break;
    default:
        addCoded(1, kBroadcastSlot, 2);
        addTransport(1, 2);
    }
    add(utranChannelQuality(transport, coded));
}

void UTRANScenario::addCells()
{
    add(cellList(_drive.serving(), _drive.neighbours(), [this](std::size_t cell, bool isServing) {
        return listed(kUTRANTown[cell], isServing, _drive.averageLevel(cell));
    }));
}

} // namespace orvane
