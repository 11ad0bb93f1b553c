#pragma once

#include "telephonyd/phone/PacketWriter.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// What the writer has put together, as the payload of a log item of the modem.
inline PhoneMessage modemItem(std::uint16_t code, PacketWriter& writer)
{
    return {PhoneMessage::Kind::Modem, code, writer.take()};
}

} // namespace orvane
