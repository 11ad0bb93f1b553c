#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"

#include <cstdint>
#include <stdexcept>
#include <string_view>

namespace orvane
{

// A diagnostic log message of exactly `size` bytes: its header, and zeros where nothing is put.
// Storing outside the message is a mistake of the test and throws.
class PacketBuilder
{
public:
    // Codes of 0xFF0000 and above make a message of the telephony server's own.
    PacketBuilder(std::uint32_t code, std::size_t size) : _bytes(size, 0)
    {
        put8(0, code >= 0xFF0000 ? 0xFF : 1);
        put16(1, static_cast<std::uint32_t>(size - 1));
        put16(3, code & 0xFFFF);
    }

    PacketBuilder& put8(std::size_t offset, std::uint32_t value) { return put(offset, 1, value); }
    PacketBuilder& put16(std::size_t offset, std::uint32_t value) { return put(offset, 2, value); }
    PacketBuilder& put32(std::size_t offset, std::uint32_t value) { return put(offset, 4, value); }
    // `count` bits from bit `bit` of the byte at `offset` on, the others as they were.
    PacketBuilder& putBits(std::size_t offset, unsigned bit, unsigned count, std::uint32_t value)
    {
        for (unsigned i = 0; i < count; ++i) {
            std::uint8_t& byte = _bytes.at(offset + (bit + i) / 8);
            const auto mask = static_cast<std::uint8_t>(1U << ((bit + i) % 8));
            byte = static_cast<std::uint8_t>((value >> i & 1) != 0 ? byte | mask : byte & ~mask);
        }
        return *this;
    }

    [[nodiscard]] const Bytes& bytes() const { return _bytes; }
    operator const Bytes&() const { return _bytes; }

    // A message of the telephony server: the header, then the property list.
    static Bytes withPropertyList(std::uint32_t code, const PropertyValue& content)
    {
        const auto xml = writeXmlPropertyList(content);
        if (!xml)
            throw std::invalid_argument("the content cannot be written");
        return withText(code, *xml);
    }
    static Bytes withText(std::uint32_t code, std::string_view text)
    {
        Bytes bytes = PacketBuilder(code, 13 + text.size()).bytes();
        std::copy(text.begin(), text.end(), bytes.begin() + 13);
        return bytes;
    }

private:
    PacketBuilder& put(std::size_t offset, std::size_t width, std::uint32_t value)
    {
        for (std::size_t i = 0; i < width; ++i)
            _bytes.at(offset + i) = static_cast<std::uint8_t>(value >> (8 * i));
        return *this;
    }

    Bytes _bytes;
};

} // namespace orvane
