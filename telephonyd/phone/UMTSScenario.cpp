#include "telephonyd/phone/UMTSScenario.h"

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "telephonyd/phone/MobilityPackets.h"
#include "telephonyd/phone/ServerItems.h"

#include <algorithm>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr milliseconds kActiveSetBusyEvery{400};
constexpr milliseconds kActiveSetIdleEvery{1280};
constexpr milliseconds kTransmitPowerEvery{400};
constexpr milliseconds kBlockErrorsEvery{960};
constexpr milliseconds kFastDownlinkEvery{480};
constexpr milliseconds kDiscontinuousEvery{1920};
constexpr milliseconds kColoursEvery{3000};
constexpr milliseconds kCellsEvery{1000};

constexpr Phases::Range kGSMConnectedFor{9, 18};
constexpr Phases::Range kGSMIdleFor{8, 16};
constexpr Phases::Range kDataFor{25, 60};
constexpr Phases::Range kNoDataFor{6, 14};

} // namespace

UMTSScenario::UMTSScenario(std::uint64_t seed)
    : _drive(kUMTSTownMasts, kUMTSTownRoad, seed), _umts(seed + 1),
      _gsm(kGSMConnectedFor, kGSMIdleFor, false, seed + 2),
      _dataConnection(kDataFor, kNoDataFor, true, seed + 3), _noise(seed + 4),
      // Three of a call's speech, one of signalling.
      _blocks{
          {1,  0, 0},
          {2,  0, 0},
          {3,  0, 0},
          {24, 0, 0}
}
{
}

std::string UMTSScenario::technology() const { return kTSLogChannelTechnology_Varnel_GSM; }

std::vector<PhoneMessage> UMTSScenario::step(milliseconds now)
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

// Switched on, the phone has listened to both networks and known nothing of either before.
void UMTSScenario::first(Messages& messages)
{
    const UMTSTownCell& umts = kUMTSTown[bestOf(true)];
    messages.push_back(serverItem(kSimFilesItem, simFiles()));
    messages.push_back(registration(RegistrationState::AutomaticSearch));
    messages.push_back(circuitMobility(CircuitState::Idle, CircuitSubState::NetworkSearch, false));
    messages.push_back(
        packetMobility(PacketState::Deregistered, PacketSubState::AttachNeeded, false));
    messages.push_back(systemInformation(serving(), ServiceType::Limited));
    messages.push_back(equivalentNetworks(serving().locationArea));
    messages.push_back(umtsRadioState(RadioState::Idle));
    messages.push_back(umtsServingCell(umts));
    messages.push_back(umtsCiphering(false));
    addActiveSet(messages);
    addTransmitPower(messages);
    addBlockErrors(messages);
    addFastDownlink(messages);
    messages.push_back(
        gsmRadioState(serving().isUmts ? GSMRadioState::Inactive : GSMRadioState::Idle, false));
    const UMTSTownCell& gsm = kUMTSTown[bestOf(false)];
    messages.push_back(gsmServingCell(gsm));
    messages.push_back(gsmMobileAllocation(gsm));
    messages.push_back(gsmDedicatedChannel(gsm));
    messages.push_back(gsmDiscontinuousTransmission(false));
    for (PhoneMessage& each : gprsInformation(gsm))
        messages.push_back(std::move(each));
    addGSMColours(messages);
    addMeasurements(messages);
    if (serving().isUmts)
        addGSMMeasurement(messages);
    addDataConnections(messages);
}

void UMTSScenario::next(Messages& messages)
{
    if (_dataConnection.advance(_now)) {
        _dataConnections += _dataConnection.isOn() ? 1 : 0;
        addDataConnections(messages);
    }
    const bool wasUmts = serving().isUmts;
    const bool cellChanged = _drive.step(_use != Use::None);
    if (cellChanged)
        changeCell(wasUmts, messages);
    registerWherePhoneIs();
    const bool gsmTurned = _gsm.advance(_now);
    if (serving().isUmts) {
        if (_umts.advance(_now))
            changeUMTSConnection(messages);
    } else if (gsmTurned) {
        changeGSMConnection();
    }
    _agenda.takeDue(_now, messages);
    if (serving().isUmts)
        addUMTSMeasurements(messages);
    else if (_use == Use::Call && isDue(kDiscontinuousEvery))
        messages.push_back(gsmDiscontinuousTransmission(_noise.below(3) > 0));
    if (isDue(kColoursEvery) && !serving().isUmts)
        addGSMColours(messages);
    if (cellChanged || isDue(kCellsEvery))
        addMeasurements(messages);
}

const UMTSTownCell& UMTSScenario::serving() const { return kUMTSTown[_drive.serving()]; }

bool UMTSScenario::isDue(milliseconds every) const { return _now % every == milliseconds(0); }

// The ranking and the server's list of cells both tell the UMTS neighbours, the list and the GSM
// measurement both the GSM ones. What comes last stays visible: the GSM measurement in GSM; in UMTS
// the ranking while there is one, which a connection on channels of its own does without.
void UMTSScenario::addMeasurements(Messages& messages)
{
    if (!serving().isUmts) {
        addGSMRanking(messages);
        addCells(messages);
        addGSMMeasurement(messages);
        return;
    }
    addCells(messages);
    if (_umts.state() != RadioState::CellDch)
        addUMTSRanking(messages);
}

void UMTSScenario::addUMTSMeasurements(Messages& messages)
{
    const RadioState state = _umts.state();
    const bool isBusy = state == RadioState::CellDch;
    if (isDue(isBusy ? kActiveSetBusyEvery : kActiveSetIdleEvery))
        addActiveSet(messages);
    if ((isBusy || state == RadioState::CellFach) && isDue(kTransmitPowerEvery))
        addTransmitPower(messages);
    if (isBusy && isDue(kBlockErrorsEvery))
        addBlockErrors(messages);
    if (isBusy && _use == Use::Data && isDue(kFastDownlinkEvery))
        addFastDownlink(messages);
}

// The one for messages stays; the one for the rest comes and goes, each time with a new address.
void UMTSScenario::addDataConnections(Messages& messages) const
{
    auto contexts = PropertyValue::newArray();
    contexts.asArray()->append(packetDataContext("mms", "Background", 5, 0));
    if (_dataConnection.isOn())
        contexts.asArray()->append(
            packetDataContext("internet", "Interactive", 6, _dataConnections));
    messages.push_back(serverItem(kDataConnectionsItem, contexts));
}

} // namespace orvane
