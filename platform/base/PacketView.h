#pragma once

#include "platform/base/Bytes.h"

#include <bit>
#include <cstdint>
#include <cstring>
#include <optional>

namespace orvane
{

// A read-only window onto one log message or one record of it, the only way in which packet bytes
// are read. Owns nothing. Offsets count from the window's first byte; multi-byte fields are
// little-endian at any alignment; whatever reaches past the window's end is not there.
class PacketView
{
public:
    explicit PacketView(ByteView bytes) : _bytes(bytes) {}

    [[nodiscard]] std::size_t size() const { return _bytes.size(); }
    [[nodiscard]] bool holds(std::size_t offset, std::size_t count) const
    {
        // Subtract, never add: offset + count can wrap when a packet supplied them.
        return offset <= size() && count <= size() - offset;
    }

    // `width` is 1 to 8 bytes.
    [[nodiscard]] std::optional<std::uint64_t> unsignedAt(std::size_t offset,
                                                          std::size_t width) const
    {
        if (!holds(offset, width))
            return std::nullopt;
        const std::uint64_t value = bytesAt(offset, width);
        return width < 8 ? value & ((std::uint64_t{1} << 8 * width) - 1) : value;
    }

    // `count` bits (1 to 32) from bit `bit` on (0 is the lowest) of the byte at `offset`; a field
    // that crosses a byte boundary goes on in the next byte's low bits.
    [[nodiscard]] std::optional<std::uint32_t> bitsAt(std::size_t offset, unsigned bit,
                                                      unsigned count) const
    {
        const std::size_t width = (bit + count + 7) / 8;
        if (!holds(offset, width))
            return std::nullopt;
        const std::uint64_t mask = (std::uint64_t{1} << count) - 1;
        return static_cast<std::uint32_t>(bytesAt(offset, width) >> bit & mask);
    }

    // The window's bytes from `offset` on; empty when that lies past the end.
    [[nodiscard]] PacketView from(std::size_t offset) const
    {
        return PacketView(offset <= size() ? _bytes.subspan(offset) : ByteView());
    }
    [[nodiscard]] ByteView bytes() const { return _bytes; }

private:
    // The bytes at an offset that holds them, little-endian; above them stands anything.
    [[nodiscard]] std::uint64_t bytesAt(std::size_t offset, std::size_t width) const
    {
        std::uint64_t value = 0;
        if constexpr (std::endian::native == std::endian::little) {
            // One load where eight bytes are there.
            if (holds(offset, sizeof value)) {
                std::memcpy(&value, _bytes.data() + offset, sizeof value);
                return value;
            }
        }
        for (std::size_t i = width; i-- > 0;)
            value = value << 8 | _bytes[offset + i];
        return value;
    }

    ByteView _bytes;
};

} // namespace orvane
