#pragma once

#include "telephonyd/phone/Phases.h"

#include <cstdint>

namespace orvane
{

// Numbers are those of the packets.
enum class OneXState : std::uint8_t {
    Starting = 2,
    Acquisition = 3,
    Sync = 4,
    Slew = 5,
    Paging = 6,
    Sleep = 7,
    Traffic = 8,
};
enum class EvdoState : std::uint8_t {
    Inactive = 0,
    Acquisition = 1,
    Sync = 2,
    Idle = 3,
    Access = 4,
    Connected = 5,
};
enum class EvdoSession : std::uint8_t {
    Closed = 0,
    AddressSetup = 1,
    PhoneNegotiates = 2,
    NetworkNegotiates = 3,
    Open = 4,
};

// A phone for 1x and EV-DO with one radio: while it is in a 1x call EV-DO rests, and after the call
// both are looked for anew. Data are moved now and then, in a session that every EV-DO subnet
// negotiates anew.
class CDMAPhone
{
public:
    explicit CDMAPhone(std::uint64_t seed);

    // Goes on to `now`, which never goes back, in the subnet of that colour code.
    void advance(std::chrono::milliseconds now, std::uint8_t colourCode);

    [[nodiscard]] OneXState oneX() const { return _oneX; }
    [[nodiscard]] EvdoState evdo() const { return _evdo; }
    [[nodiscard]] EvdoSession session() const { return _session; }
    [[nodiscard]] std::uint8_t colourCode() const { return _colourCode; }  // of the session
    [[nodiscard]] std::uint32_t terminalId() const { return _terminalId; } // UATI24, of the session
    [[nodiscard]] bool isInTraffic() const { return _oneX == OneXState::Traffic; }
    // Whether data are moved.
    [[nodiscard]] bool isConnected() const
    {
        return _evdo == EvdoState::Connected && _session == EvdoSession::Open;
    }

private:
    [[nodiscard]] OneXState oneXAt(std::chrono::milliseconds now) const;
    [[nodiscard]] EvdoState evdoAt(std::chrono::milliseconds now) const;
    [[nodiscard]] EvdoSession sessionAt(std::chrono::milliseconds now) const;
    void endCall(std::chrono::milliseconds now);
    void joinSubnet(std::uint8_t colourCode, std::chrono::milliseconds now);

    Phases _call;
    Phases _data;
    PhoneRandom _random;
    OneXState _oneX = OneXState::Paging;
    EvdoState _evdo = EvdoState::Idle;
    EvdoSession _session = EvdoSession::Open;
    std::uint8_t _colourCode = 0; // none yet
    std::uint32_t _terminalId = 0;
    // Since when; long ago where the phone was so at its start.
    std::chrono::milliseconds _outOfCallSince{-3600000};
    std::chrono::milliseconds _dataSince{-3600000};
    std::chrono::milliseconds _subnetSince{-3600000};
};

} // namespace orvane
