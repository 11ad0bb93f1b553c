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

PropertyValue cellDictionary(const UTRANCell& cell, const char* type, double power)
{
    const auto number = [](std::int64_t value) { return PropertyValue::integer(value); };
    return PropertyValue::dictionaryOf({
        {kTSCellMonitorCellRadioAccessTechnology, kTSCellMonitorRadioAccessTechnologyUTRAN2},
        {kTSCellMonitorCellType,                  type                                     },
        {kTSCellMonitorMCC,                       number(1)                                },
        {kTSCellMonitorMNC,                       number(1)                                },
        {kTSCellMonitorLAC,                       number(cell.locationArea)                },
        {kTSCellMonitorCellId,                    number(cell.cellIdentity)                },
        {kTSCellMonitorBandInfo,                  number(cell.band)                        },
        {kTSCellMonitorSCN,                       number(cell.cellParameter)               },
        {kTSCellMonitorUARFCN,                    number(cell.channel)                     },
        {kTSCellMonitorRSCP,                      number(std::lround(power))               },
    });
}

} // namespace

UTRANScenario::UTRANScenario(std::uint64_t seed)
    : _drive(kUTRANTownMasts, kLTETownRoad, seed), _radio(seed + 1),
      _dataConnection(kDataFor, kNoDataFor, true, seed + 2), _noise(seed + 3)
{
}

std::string UTRANScenario::technology() const { return kTSLogChannelTechnology_Varnel_UTRAN2; }

std::vector<PhoneMessage> UTRANScenario::step(milliseconds now)
{
    Messages messages;
    if (_now < milliseconds(0)) {
        _now = milliseconds(0);
        first(messages);
    }
    while (_now + Drive::kStep <= now) {
        _now += Drive::kStep;
        next(messages);
    }
    return messages;
}

void UTRANScenario::first(Messages& messages)
{
    _locationArea = kUTRANTown[_drive.serving()].locationArea;
    messages.push_back(utranRadioState(_radio.state()));
    addServingCell(messages);
    messages.push_back(serverItem(kSimFilesItem, simFiles()));
    addCells(messages);
    addDataConnections(messages);
    addNeighbours(messages);
    addGSMNeighbours(messages);
    addChannelQuality(messages);
}

void UTRANScenario::next(Messages& messages)
{
    if (_radio.advance(_now))
        messages.push_back(utranRadioState(_radio.state()));
    if (_dataConnection.advance(_now)) {
        _dataConnections += _dataConnection.isOn() ? 1 : 0;
        addDataConnections(messages);
    }
    const bool cellChanged = _drive.step(isOnOwnChannels(_radio.state()));
    if (cellChanged)
        changeCell(messages);
    if (_isRegistering && _now >= _registeredAt) {
        _isRegistering = false;
        addServingCell(messages);
    }
    if (cellChanged || isDue(kCellsEvery))
        addCells(messages);
    const milliseconds every =
        isReceiving(_radio.state()) ? kConnectedMeasurementEvery : kIdleMeasurementEvery;
    if (cellChanged || isDue(every)) {
        addNeighbours(messages);
        addChannelQuality(messages);
    }
    if (isDue(kGSMMeasurementEvery))
        addGSMNeighbours(messages);
}

bool UTRANScenario::isDue(milliseconds every) const { return _now % every == milliseconds(0); }

void UTRANScenario::changeCell(Messages& messages)
{
    const std::uint16_t area = kUTRANTown[_drive.serving()].locationArea;
    if (area != _locationArea) {
        _locationArea = area;
        _isRegistering = true;
        _registeredAt = _now + kRegistrationTakes;
    }
    addServingCell(messages);
}

// Until the network has taken the phone in, it lets it make emergency calls only.
void UTRANScenario::addServingCell(Messages& messages) const
{
    messages.push_back(utranServingCell(kUTRANTown[_drive.serving()], _isRegistering));
}

void UTRANScenario::addNeighbours(Messages& messages) const
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
    messages.push_back(utranNeighbours(cells));
}

// GSM transceivers share some of the masts.
void UTRANScenario::addGSMNeighbours(Messages& messages) const
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
    messages.push_back(utranGSMNeighbours(cells));
}

// What there is to be measured goes by the state: the paging channel, the shared channels, or those
// of a call and of a data transfer by turns.
void UTRANScenario::addChannelQuality(Messages& messages)
{
    constexpr std::uint8_t kBroadcastSlot = 0;
    const double ratio = signalToInterference(_drive.level(_drive.serving()));
    std::vector<TransportChannel> transport;
    std::vector<CodedChannel> coded;
    const auto add = [&](std::uint8_t number, double more) {
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
        add(1, 2);
        if (_radio.transfers() % 2 == 1) {
            add(2, 2);
            add(3, 3);
            add(31, 1);
        } else {
            add(31, 1);
            addCoded(2, 6, -1);
        }
        break;
    case RadioState::CellFach:
        addCoded(1, 4, 0);
        add(1, 2);
        add(2, 2);
        break;
    default:
        addCoded(1, kBroadcastSlot, 2);
        add(1, 2);
    }
    messages.push_back(utranChannelQuality(transport, coded));
}

void UTRANScenario::addCells(Messages& messages) const
{
    auto cells = PropertyValue::newArray();
    const auto append = [&](std::size_t cell, const char* type) {
        cells.asArray()->append(cellDictionary(kUTRANTown[cell], type, _drive.averageLevel(cell)));
    };
    append(_drive.serving(), kTSCellMonitorCellTypeServing);
    for (const std::size_t cell : _drive.neighbours())
        append(cell, kTSCellMonitorCellTypeNeighbor);
    messages.push_back(serverItem(kCellsItem, cells));
}

// The one for messages stays; the one for the rest comes and goes, each time with a new address.
void UTRANScenario::addDataConnections(Messages& messages) const
{
    auto connections = PropertyValue::newArray();
    connections.asArray()->append(packetDataContext("mms", "Background", 5, 0));
    if (_dataConnection.isOn())
        connections.asArray()->append(
            packetDataContext("internet", "Interactive", 6, _dataConnections));
    messages.push_back(serverItem(kDataConnectionsItem, connections));
}

} // namespace orvane
