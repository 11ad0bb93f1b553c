#pragma once

#include "platform/base/PacketView.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/Reading.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace orvane
{

enum class Coding : std::uint8_t { Unsigned, Signed, BigEndian };

// One row of a packet or record: where it stands and how it is shown. Tables of these are what a
// section consists of; they are static data, since the readings refer to their elements.
struct Field : RowDescription {
    std::uint16_t offset; // first byte
    std::uint8_t bit;     // first bit in that byte, 0 the lowest
    std::uint8_t bits;    // 1 to 32
    Coding coding;
    bool isConditional; // the format does not write every raw number

    // The raw number, or nullopt when the packet ends before it.
    [[nodiscard]] std::optional<std::int64_t> valueIn(PacketView packet) const
    {
        const auto raw = packet.bitsAt(offset, bit, bits);
        if (!raw)
            return std::nullopt;
        return coding == Coding::Unsigned ? static_cast<std::int64_t>(*raw) : decoded(*raw);
    }
    // The same, or nullopt also for a number that writes no row.
    [[nodiscard]] std::optional<std::int64_t> rowIn(PacketView packet) const
    {
        const auto raw = valueIn(packet);
        return raw && isConditional && !format->writes(*raw) ? std::nullopt : raw;
    }
    // The offset just past the last byte read.
    [[nodiscard]] constexpr std::size_t end() const
    {
        return offset + (static_cast<std::size_t>(bit) + bits + 7) / 8;
    }

    // What a signed or big-endian field makes of its bits.
    [[nodiscard]] std::int64_t decoded(std::uint32_t raw) const;
};

// A field of `bits` bits from bit `bit` of the byte at `offset` on. The format is static data.
constexpr Field bitsField(const char* row, std::uint16_t offset, std::uint8_t bit,
                          std::uint8_t bits, const Format& format, Coding coding = Coding::Unsigned)
{
    return {
        {row, &format},
        offset, bit, bits, coding, !format.alwaysWrites()
    };
}

// A field of `width` whole bytes (1 to 4) at `offset`.
constexpr Field bytesField(const char* row, std::uint16_t offset, unsigned width,
                           const Format& format, Coding coding = Coding::Unsigned)
{
    return bitsField(row, offset, 0, static_cast<std::uint8_t>(8 * width), format, coding);
}

// How many bytes of a packet or record the fields read: it is whole when it has as many.
constexpr std::size_t bytesRead(std::span<const Field> fields)
{
    std::size_t end = 0;
    for (const Field& field : fields)
        end = field.end() > end ? field.end() : end;
    return end;
}

// Writes the fields' rows in order. A field beyond the packet's end leaves its row as it was; with
// no rows given nothing happens.
void writeRows(PropertyDictionary* rows, PacketView packet, std::span<const Field> fields);

// A reading of the message that is being decoded.
Reading readingOf(const RowDescription& description, std::int64_t raw);
// Stores such a reading under the description's row.
void setReading(PropertyDictionary* rows, const RowDescription& description, std::int64_t raw);
// Stores the text under the row's key, reusing what is there.
void setRow(PropertyDictionary* rows, const char* row, std::string text);
// Stores a new array of the elements under the row's key, in place of what is there.
void setListRow(PropertyDictionary* rows, const char* row, std::vector<PropertyValue> elements);

} // namespace orvane
