#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"
#include "telephonyd/phone/Scenario.h"

#include <algorithm>
#include <memory>
#include <set>
#include <utility>

namespace orvane
{

// Shared by tests of simulated phones: everything that a phone sends on a long tour, and functions
// that read it.

struct TimedMessage {
    std::chrono::milliseconds at;
    PhoneMessage message;
};
using Tour = std::vector<TimedMessage>;

inline Tour tourOf(Scenario& scenario, std::chrono::seconds duration,
                   std::chrono::milliseconds step = std::chrono::milliseconds(40))
{
    Tour found;
    for (std::chrono::milliseconds now{0}; now <= duration; now += step)
        for (PhoneMessage& message : scenario.step(now))
            found.push_back({now, std::move(message)});
    return found;
}

inline Tour ofCode(const Tour& tour, std::uint16_t code,
                   PhoneMessage::Kind kind = PhoneMessage::Kind::Modem)
{
    Tour found;
    for (const TimedMessage& each : tour)
        if (each.message.kind == kind && each.message.code == code)
            found.push_back(each);
    return found;
}

// Kinds and codes of the messages between the two times.
inline std::set<std::pair<PhoneMessage::Kind, unsigned>>
codesBetween(const Tour& tour, std::chrono::milliseconds from, std::chrono::milliseconds to)
{
    std::set<std::pair<PhoneMessage::Kind, unsigned>> found;
    for (const TimedMessage& each : tour)
        if (each.at >= from && each.at <= to)
            found.insert({each.message.kind, each.message.code});
    return found;
}

inline bool sameMessages(const Tour& left, const Tour& right)
{
    return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                      [](const TimedMessage& one, const TimedMessage& other) {
                          return one.message.kind == other.message.kind &&
                                 one.message.code == other.message.code &&
                                 one.message.payload == other.message.payload;
                      });
}

inline PropertyValue listOf(const TimedMessage& item)
{
    return readPropertyList(item.message.payload).value;
}

// Offsets count from the start of the whole message, header included, as receivers count them.
constexpr std::size_t kPhoneHeaderBytes = 13;

inline std::size_t sizeOf(const PhoneMessage& message)
{
    return kPhoneHeaderBytes + message.payload.size();
}
inline unsigned byteAt(const PhoneMessage& message, std::size_t offset)
{
    return message.payload.at(offset - kPhoneHeaderBytes);
}
inline unsigned wordAt(const PhoneMessage& message, std::size_t offset)
{
    return byteAt(message, offset) | byteAt(message, offset + 1) << 8;
}
inline int signedWordAt(const PhoneMessage& message, std::size_t offset)
{
    return static_cast<std::int16_t>(wordAt(message, offset));
}
inline unsigned longAt(const PhoneMessage& message, std::size_t offset)
{
    return wordAt(message, offset) | wordAt(message, offset + 2) << 16;
}
// `width` bits that begin at that bit of the byte at the offset.
inline unsigned bitsAt(const PhoneMessage& message, std::size_t offset, unsigned bit,
                       unsigned width)
{
    unsigned value = 0;
    for (unsigned i = 0; i < width; ++i) {
        const unsigned at = bit + i;
        value |= (byteAt(message, offset + at / 8) >> at % 8 & 1U) << i;
    }
    return value;
}

} // namespace orvane
