#pragma once

#include "platform/base/Bytes.h"

#include <chrono>
#include <cstdint>
#include <string>
#include <vector>

namespace orvane
{

// What a simulated phone reports, before it gets its header.
struct PhoneMessage {
    enum class Kind {
        Modem,  // a diagnostic log item of the modem
        Server, // an item that the telephony server makes itself; its code is the item's number
        Bare,   // no log item: the payload is the whole message, sent whatever was asked for
    };
    Kind kind = Kind::Modem;
    std::uint16_t code = 0;
    Bytes payload;
};

// A simulated phone of one radio technology. Its messages depend only on its seed and on the times
// at which step() is called.
class Scenario
{
public:
    virtual ~Scenario() = default;
    // The technology constant.
    [[nodiscard]] virtual std::string technology() const = 0;
    // Advances the phone to `now`, counted from its start, and returns the messages that became
    // due. The first call is at 0 and returns one message of each kind. Time never goes back.
    virtual std::vector<PhoneMessage> step(std::chrono::milliseconds now) = 0;
};

} // namespace orvane
