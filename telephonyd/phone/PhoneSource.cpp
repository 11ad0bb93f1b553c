#include "telephonyd/phone/PhoneSource.h"

#include "platform/base/Bytes.h"
#include "platform/base/LogMessage.h"
#include "platform/services/Services.h"
#include "telephonyd/phone/PacketWriter.h"

namespace orvane
{

namespace
{

// The item's length, code and timestamp; the type byte before them does not count as the item's.
constexpr std::size_t kItemHeaderBytes = 12;

} // namespace

PhoneSource::PhoneSource(MainQueue& queue, std::unique_ptr<Scenario> scenario)
    : _queue(queue), _scenario(std::move(scenario))
{
}

void PhoneSource::start(const LogSelection& selection, Send send)
{
    _selection = selection;
    _send = std::move(send);
    _timer = _queue.repeatingTimer(kStep, [this] { step(); });
}

void PhoneSource::step()
{
    const std::vector<PhoneMessage> messages = _scenario->step(_now);
    _now += kStep;
    for (const PhoneMessage& message : messages)
        if (message.kind == PhoneMessage::Kind::Bare)
            _send(message.payload);
        else if (isWanted(message))
            _send(logMessage(message));
}

bool PhoneSource::isWanted(const PhoneMessage& message) const
{
    return message.kind == PhoneMessage::Kind::Modem ? _selection.modemCodes.contains(message.code)
                                                     : _selection.extraCodes.contains(message.code);
}

Bytes PhoneSource::logMessage(const PhoneMessage& message)
{
    const std::uint64_t timestamp = logTimestamp(Services::current().clock().secondsSince1970());
    PacketWriter writer;
    if (++_sent % kWrapEvery == 0)
        writer.put8(kLogWrapper).put8(0);
    writer.put8(message.kind == PhoneMessage::Kind::Modem ? kModemItem : kServerItem)
        .put16(static_cast<std::uint32_t>(kItemHeaderBytes + message.payload.size()))
        .put16(message.code)
        .put32(static_cast<std::uint32_t>(timestamp & 0xFFFFFFFF))
        .put32(static_cast<std::uint32_t>(timestamp >> 32))
        .append(message.payload);
    return writer.take();
}

std::uint64_t logTimestamp(double secondsSince1970)
{
    constexpr double kTicksPerSecond = 800 * 65536.0;
    const double ticks =
        (secondsSince1970 - static_cast<double>(kLogEpochSeconds)) * kTicksPerSecond;
    return ticks > 0 && ticks < 0x1p63 ? static_cast<std::uint64_t>(ticks) : 0;
}

} // namespace orvane
