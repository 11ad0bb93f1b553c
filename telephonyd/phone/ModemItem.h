#pragma once

#include "telephonyd/phone/PacketWriter.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// A log item of the modem with the writer's bytes as its payload.
inline PhoneMessage modemItem(std::uint16_t code, PacketWriter& writer)
{
    return {PhoneMessage::Kind::Modem, code, writer.take()};
}

} // namespace orvane
