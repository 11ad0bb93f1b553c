#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>

namespace orvane
{

// Puts a packet together field by field, little-endian, in the order in which the fields stand.
class PacketWriter
{
public:
    // Whole bytes begin at the next byte boundary.
    PacketWriter& put8(std::uint32_t value) { return put(value, 1); }
    PacketWriter& put16(std::uint32_t value) { return put(value, 2); }
    PacketWriter& put32(std::uint32_t value) { return put(value, 4); }
    // Bytes of zero.
    PacketWriter& skip(std::size_t count);
    // The value's lowest `width` bits (0 to 32), starting at the lowest free bit of the byte that
    // is under way and going on in the next.
    PacketWriter& bits(std::uint32_t value, unsigned width);
    PacketWriter& append(ByteView bytes);

    [[nodiscard]] std::size_t size() const { return _bytes.size(); }
    [[nodiscard]] Bytes take() { return std::move(_bytes); }

private:
    PacketWriter& put(std::uint32_t value, unsigned width);

    Bytes _bytes;
    unsigned _usedBits = 0; // of the last byte; 0 at a byte boundary
};

// The whole number nearest to (value - zero) / step, kept within `width` bits: how a level becomes
// the raw value of a field.
std::uint32_t rawValue(double value, double zero, double step, unsigned width);

} // namespace orvane
