// What the phone of UMTSScenario does: how it registers, changes cells and makes connections.

#include "telephonyd/phone/MobilityPackets.h"
#include "telephonyd/phone/UMTSScenario.h"

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr milliseconds kFirstRegistration{800};
constexpr milliseconds kLocationUpdateTakes{2000};
constexpr milliseconds kRoutingUpdateTakes{1200};

} // namespace

// Registers in both areas, one after the other, where the location area is new, and in the routing
// area alone where only that one is new. Does nothing during a connection.
void UMTSScenario::registerWherePhoneIs()
{
    const UMTSTownCell& cell = serving();
    const bool isElsewhere = cell.locationArea != _locationArea;
    if (now() < _registeredAt || now() < kFirstRegistration || _use != Use::None ||
        (!isElsewhere && cell.routingArea == _routingArea))
        return;
    const bool isFirst = _locationArea == 0;
    _locationArea = cell.locationArea;
    _routingArea = cell.routingArea;
    milliseconds at = now();
    _agenda.add(at, registration(RegistrationState::Registering));
    if (cell.isUmts)
        _umts.connect(at);
    if (isElsewhere)
        at = updateLocation(at);
    updateRoutingArea(at, isFirst);
    _registeredAt = at + kRoutingUpdateTakes;
    _agenda.add(_registeredAt, registration(RegistrationState::Idle));
    _agenda.add(_registeredAt, systemInformation(cell, ServiceType::All));
    _agenda.add(_registeredAt, equivalentNetworks(cell.locationArea));
}

milliseconds UMTSScenario::updateLocation(milliseconds at)
{
    using enum CircuitState;
    const auto add = [&](int after, CircuitState state, CircuitSubState subState, bool isUpdated) {
        _agenda.add(at + milliseconds(after), circuitMobility(state, subState, isUpdated));
    };
    _agenda.add(at, systemInformation(serving(), ServiceType::Limited));
    add(0, Idle, CircuitSubState::UpdateNeeded, false);
    add(200, WaitForRadioToUpdate, CircuitSubState::None, false);
    add(800, LocationUpdateInitiated, CircuitSubState::None, false);
    add(1600, WaitForNetworkCommand, CircuitSubState::None, true);
    add(2000, Idle, CircuitSubState::NormalService, true);
    if (!serving().isUmts)
        for (const auto& [after, state] : {
                 std::pair{200,  GSMRadioState::ConnectionPending},
                 std::pair{800,  GSMRadioState::DataTransfer     },
                 std::pair{1800, GSMRadioState::ConnectionRelease},
                 std::pair{2000, GSMRadioState::Idle             }
        })
            _agenda.add(at + milliseconds(after), gsmRadioState(state, true));
    return at + kLocationUpdateTakes;
}

void UMTSScenario::updateRoutingArea(milliseconds at, bool isAttach)
{
    if (!isAttach)
        _agenda.add(at,
                    packetMobility(PacketState::Registered, PacketSubState::UpdateNeeded, false));
    _agenda.add(at + milliseconds(200), packetMobility(isAttach ? PacketState::AttachInitiated
                                                                : PacketState::AreaUpdateInitiated,
                                                       PacketSubState::None, false));
    _agenda.add(at + kRoutingUpdateTakes,
                packetMobility(PacketState::Registered, PacketSubState::NormalService, true));
}

void UMTSScenario::beginCall()
{
    using enum CircuitState;
    _use = Use::Call;
    for (const auto& [after, state] : {
             std::pair{0,    WaitForRadioToConnect    },
             std::pair{500,  WaitForOutgoingConnection},
             std::pair{1200, ConnectionActive         }
    })
        _agenda.add(now() + milliseconds(after),
                    circuitMobility(state, CircuitSubState::None, true));
}

void UMTSScenario::endCall()
{
    using enum CircuitState;
    _use = Use::None;
    _agenda.add(now(), circuitMobility(WaitForNetworkCommand, CircuitSubState::None, true));
    _agenda.add(now() + milliseconds(400),
                circuitMobility(Idle, CircuitSubState::NormalService, true));
}

void UMTSScenario::changeCell(bool wasUmts)
{
    const bool isUmts = serving().isUmts;
    if (isUmts != wasUmts) {
        // Procedures that began in the other network are not finished.
        _agenda.clear();
        _use = Use::None;
        _registeredAt = now();
        if (isUmts)
            enterUMTS();
        else
            enterGSM();
    }
    if (isUmts) {
        add(umtsServingCell(serving()));
        return;
    }
    if (!wasUmts && _use == Use::None) {
        add(gsmRadioState(GSMRadioState::Reselection, false));
        _agenda.add(now() + milliseconds(400), gsmRadioState(GSMRadioState::Idle, false));
    }
    addGSMCell();
}

void UMTSScenario::enterUMTS()
{
    add(gsmRadioState(GSMRadioState::GoingToUMTS, false));
    add(gsmRadioState(GSMRadioState::Inactive, false));
    _umts.release(now());
    _umtsBefore = RadioState::Idle;
    add(umtsRadioState(RadioState::Idle));
}

void UMTSScenario::enterGSM()
{
    _umts.release(now());
    _umtsBefore = RadioState::Idle;
    add(umtsRadioState(RadioState::Idle));
    add(umtsCiphering(false));
    add(gsmRadioState(GSMRadioState::ComingFromUMTS, false));
    add(gsmRadioState(GSMRadioState::Idle, false));
}

// The cell's own data come at once. Its packet service is reported later, as system information
// arrives.
void UMTSScenario::addGSMCell()
{
    add(gsmServingCell(serving()));
    if (_use == Use::Call) {
        add(gsmMobileAllocation(serving()));
        add(gsmDedicatedChannel(serving()));
    }
    milliseconds at = now();
    for (PhoneMessage& each : gprsInformation(serving()))
        _agenda.add(at += milliseconds(200), std::move(each));
}

// A connection on channels of its own is a call or a data transfer by turns. One that was made for
// registration carries data.
void UMTSScenario::changeUMTSConnection()
{
    const RadioState state = _umts.state();
    add(umtsRadioState(state));
    if (_use == Use::Call)
        endCall();
    _use = Use::None;
    const bool isRegistering = now() < _registeredAt;
    switch (state) {
    case RadioState::Connecting:
        if (!isRegistering && _umts.transfers() % 2 == 0) // the next one is of data
            _agenda.add(now(), packetMobility(PacketState::ServiceRequestInitiated,
                                              PacketSubState::None, true));
        break;
    case RadioState::CellDch:
        if (_umts.transfers() % 2 == 0 && !isRegistering)
            beginCall();
        else
            _use = Use::Data;
        break;
    default:
        break;
    }
    if (_umtsBefore == RadioState::Connecting) {
        _agenda.add(now() + milliseconds(400), umtsCiphering(true));
        if (!isRegistering)
            _agenda.add(
                now() + milliseconds(400),
                packetMobility(PacketState::Registered, PacketSubState::NormalService, true));
    }
    if (state == RadioState::Idle)
        add(umtsCiphering(false));
    _umtsBefore = state;
}

// Calls and data transfers take turns; during a call packet service rests.
void UMTSScenario::changeGSMConnection()
{
    const auto addRadio = [this](int after, GSMRadioState state, bool isData) {
        _agenda.add(now() + milliseconds(after), gsmRadioState(state, isData));
    };
    const auto addPacket = [this](PacketSubState subState) {
        _agenda.add(now(), packetMobility(PacketState::Registered, subState, true));
    };
    if (_gsm.isOn()) {
        if (now() < _registeredAt || now() < kFirstRegistration)
            return; // busy enough
        const bool isCall = ++_gsmConnections % 2 == 1;
        addRadio(0, GSMRadioState::ConnectionPending, !isCall);
        addRadio(500, GSMRadioState::DataTransfer, !isCall);
        if (!isCall) {
            _use = Use::Data;
            return;
        }
        beginCall();
        addPacket(PacketSubState::Suspended);
        _agenda.add(now() + milliseconds(500), gsmMobileAllocation(serving()));
        _agenda.add(now() + milliseconds(500), gsmDedicatedChannel(serving()));
    } else if (_use != Use::None) {
        const bool isCall = _use == Use::Call;
        addRadio(0, GSMRadioState::ConnectionRelease, !isCall);
        addRadio(400, GSMRadioState::Idle, false);
        if (isCall) {
            endCall();
            addPacket(PacketSubState::NormalService);
        }
        _use = Use::None;
    }
}

} // namespace orvane
