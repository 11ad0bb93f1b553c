#pragma once

#include "platform/base/PropertyValue.h"
#include "telephonyd/phone/Agenda.h"
#include "telephonyd/phone/DataConnections.h"
#include "telephonyd/phone/DrivenScenario.h"
#include "telephonyd/phone/Phases.h"
#include "telephonyd/phone/RadioConnection.h"
#include "telephonyd/phone/UMTSPackets.h"

namespace orvane
{

// A phone that goes from GSM into UMTS and back. It registers where it comes into another area,
// makes calls and moves data in both, and has a data connection that comes up and goes.
class UMTSScenario final : public DrivenScenario
{
public:
    explicit UMTSScenario(std::uint64_t seed);

private:
    // What the phone does with the connection that it has.
    enum class Use : std::uint8_t { None, Call, Data };

    void first() override;
    void next() override;
    [[nodiscard]] const UMTSTownCell& serving() const;

    // Registration, in the core network.
    void registerWherePhoneIs();
    std::chrono::milliseconds updateLocation(std::chrono::milliseconds at);
    void updateRoutingArea(std::chrono::milliseconds at, bool isAttach);
    void beginCall();
    void endCall();

    // Radio: changes of cells and connections.
    void changeCell(bool wasUmts);
    void enterUMTS();
    void enterGSM();
    void changeUMTSConnection();
    void changeGSMConnection();
    void addGSMCell();

    // Radio: measurements.
    void addMeasurements();
    void addUMTSMeasurements();
    void addActiveSet();
    void addUMTSRanking();
    void addTransmitPower();
    void addBlockErrors();
    void addFastDownlink();
    void addGSMMeasurement();
    void addGSMColours();
    void addGSMRanking();
    void addCells();

    [[nodiscard]] std::size_t bestOf(bool isUmts) const;
    [[nodiscard]] std::vector<std::size_t> othersOf(bool isUmts) const;
    [[nodiscard]] double totalPower(std::uint16_t channel) const;
    [[nodiscard]] double quality(std::size_t cell) const;
    [[nodiscard]] UMTSLevel umtsLevel(std::size_t cell) const;
    [[nodiscard]] std::vector<GSMLevel> gsmNeighbours() const;
    [[nodiscard]] PropertyValue listed(std::size_t index, bool isServing) const;

    RadioConnection _umts;
    Phases _gsm; // connected or not
    DataConnections _dataConnections;
    PhoneRandom _noise;
    Agenda _agenda;
    RadioState _umtsBefore = RadioState::Idle;
    Use _use = Use::None;
    unsigned _gsmConnections = 0;    // that there have been
    std::uint16_t _locationArea = 0; // in which the phone is registered
    std::uint8_t _routingArea = 0;
    std::chrono::milliseconds _registeredAt{0}; // when that is or was done
    std::vector<TransportBlocks> _blocks;
};

} // namespace orvane
