#pragma once

#include "telephonyd/phone/Agenda.h"
#include "telephonyd/phone/Drive.h"
#include "telephonyd/phone/Phases.h"
#include "telephonyd/phone/RadioConnection.h"
#include "telephonyd/phone/Scenario.h"
#include "telephonyd/phone/UMTSPackets.h"

namespace orvane
{

// A phone that goes from GSM into UMTS and back. It registers where it comes into another area,
// makes calls and moves data in both, and has a data connection that comes up and goes.
class UMTSScenario final : public Scenario
{
public:
    explicit UMTSScenario(std::uint64_t seed);

    [[nodiscard]] std::string technology() const override;
    std::vector<PhoneMessage> step(std::chrono::milliseconds now) override;

private:
    using Messages = std::vector<PhoneMessage>;

    // What the phone does with the connection that it has.
    enum class Use : std::uint8_t { None, Call, Data };

    void first(Messages& messages);
    void next(Messages& messages);
    [[nodiscard]] const UMTSTownCell& serving() const;
    [[nodiscard]] bool isDue(std::chrono::milliseconds every) const;

    // Registration, in the core network.
    void registerWherePhoneIs();
    std::chrono::milliseconds updateLocation(std::chrono::milliseconds at);
    void updateRoutingArea(std::chrono::milliseconds at, bool isAttach);
    void beginCall();
    void endCall();

    // Radio: changes of cells and connections.
    void changeCell(bool wasUmts, Messages& messages);
    void enterUMTS(Messages& messages);
    void enterGSM(Messages& messages);
    void changeUMTSConnection(Messages& messages);
    void changeGSMConnection();
    void addGSMCell(Messages& messages);

    // Radio: measurements.
    void addMeasurements(Messages& messages);
    void addUMTSMeasurements(Messages& messages);
    void addActiveSet(Messages& messages) const;
    void addUMTSRanking(Messages& messages) const;
    void addTransmitPower(Messages& messages);
    void addBlockErrors(Messages& messages);
    void addFastDownlink(Messages& messages);
    void addGSMMeasurement(Messages& messages) const;
    void addGSMColours(Messages& messages) const;
    void addGSMRanking(Messages& messages) const;
    void addCells(Messages& messages) const;
    void addDataConnections(Messages& messages) const;

    [[nodiscard]] std::size_t bestOf(bool isUmts) const;
    [[nodiscard]] std::vector<std::size_t> othersOf(bool isUmts) const;
    [[nodiscard]] double totalPower(std::uint16_t channel) const;
    [[nodiscard]] double quality(std::size_t cell) const;
    [[nodiscard]] UMTSLevel umtsLevel(std::size_t cell) const;
    [[nodiscard]] std::vector<GSMLevel> gsmNeighbours() const;

    Drive _drive;
    RadioConnection _umts;
    Phases _gsm; // connected or not
    Phases _dataConnection;
    PhoneRandom _noise;
    Agenda _agenda;
    std::chrono::milliseconds _now{-1}; // before the first step
    RadioState _umtsBefore = RadioState::Idle;
    Use _use = Use::None;
    unsigned _gsmConnections = 0; // that there have been
    unsigned _dataConnections = 1;
    std::uint16_t _locationArea = 0; // in which the phone is registered
    std::uint8_t _routingArea = 0;
    std::chrono::milliseconds _registeredAt{0}; // when that is or was done
    std::vector<TransportBlocks> _blocks;
};

} // namespace orvane
