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
    : DrivenScenario(kTSLogChannelTechnology_Varnel_GSM,
                     {
                         kUMTSTownMasts, kUMTSTownRoad, seed
}),
      _umts(seed + 1), _gsm(kGSMConnectedFor, kGSMIdleFor, false, seed + 2),
      _dataConnections(DataConnections::Network::BeforeLTE, kDataFor, kNoDataFor, seed + 3),
      _noise(seed + 4),
      // Three of a call's speech, one of signalling.
      _blocks{{1, 0, 0}, {2, 0, 0}, {3, 0, 0}, {24, 0, 0}}
{
}

// The phone was just switched on and has listened to both networks.
void UMTSScenario::first()
{
    const UMTSTownCell& umts = kUMTSTown[bestOf(true)];
    add(serverItem(kSimFilesItem, simFiles()));
    add(registration(RegistrationState::AutomaticSearch));
    add(circuitMobility(CircuitState::Idle, CircuitSubState::NetworkSearch, false));
    add(packetMobility(PacketState::Deregistered, PacketSubState::AttachNeeded, false));
    add(systemInformation(serving(), ServiceType::Limited));
    add(equivalentNetworks(serving().locationArea));
    add(umtsRadioState(RadioState::Idle));
    add(umtsServingCell(umts));
    add(umtsCiphering(false));
    addActiveSet();
    addTransmitPower();
    addBlockErrors();
    addFastDownlink();
    add(gsmRadioState(serving().isUmts ? GSMRadioState::Inactive : GSMRadioState::Idle, false));
    const UMTSTownCell& gsm = kUMTSTown[bestOf(false)];
    add(gsmServingCell(gsm));
    add(gsmMobileAllocation(gsm));
    add(gsmDedicatedChannel(gsm));
    add(gsmDiscontinuousTransmission(false));
    for (PhoneMessage& each : gprsInformation(gsm))
        add(std::move(each));
    addGSMColours();
    addMeasurements();
    if (serving().isUmts)
        addGSMMeasurement();
    add(_dataConnections.item());
}

void UMTSScenario::next()
{
    if (_dataConnections.advance(now()))
        add(_dataConnections.item());
    const bool wasUmts = serving().isUmts;
    const bool cellChanged = _drive.step(_use != Use::None);
    if (cellChanged)
        changeCell(wasUmts);
    registerWherePhoneIs();
    const bool gsmTurned = _gsm.advance(now());
    if (serving().isUmts) {
        if (_umts.advance(now()))
            changeUMTSConnection();
    } else if (gsmTurned) {
        changeGSMConnection();
    }
    _agenda.takeDue(now(), messages());
    if (serving().isUmts)
        addUMTSMeasurements();
    else if (_use == Use::Call && isDue(kDiscontinuousEvery))
        add(gsmDiscontinuousTransmission(_noise.below(3) > 0));
    if (isDue(kColoursEvery) && !serving().isUmts)
        addGSMColours();
    if (cellChanged || isDue(kCellsEvery))
        addMeasurements();
}

const UMTSTownCell& UMTSScenario::serving() const { return kUMTSTown[_drive.serving()]; }

// The ranking and the server's list of cells both report the UMTS neighbours. The list and the GSM
// measurement both report the GSM ones. The last report stays visible, so the GSM measurement comes
// last in GSM, and the ranking in UMTS. A connection on channels of its own has no ranking.
void UMTSScenario::addMeasurements()
{
    if (!serving().isUmts) {
        addGSMRanking();
        addCells();
        addGSMMeasurement();
        return;
    }
    addCells();
    if (_umts.state() != RadioState::CellDch)
        addUMTSRanking();
}

void UMTSScenario::addUMTSMeasurements()
{
    const RadioState state = _umts.state();
    const bool isBusy = state == RadioState::CellDch;
    if (isDue(isBusy ? kActiveSetBusyEvery : kActiveSetIdleEvery))
        addActiveSet();
    if ((isBusy || state == RadioState::CellFach) && isDue(kTransmitPowerEvery))
        addTransmitPower();
    if (isBusy && isDue(kBlockErrorsEvery))
        addBlockErrors();
    if (isBusy && _use == Use::Data && isDue(kFastDownlinkEvery))
        addFastDownlink();
}

} // namespace orvane
