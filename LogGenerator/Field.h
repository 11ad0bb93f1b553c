#pragma once

#include "platform/base/PacketView.h"
#include "platform/base/PropertyValue.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace orvane
{

// The text of a row, or nothing when the row is not to be written.
using RowText = std::optional<std::string>;

// Turns a field's raw number into the row's text (LogGenerator/Formats.h has the common ones).
using Format = RowText (*)(std::int64_t raw);

enum class Coding : std::uint8_t { Unsigned, Signed, BigEndian };

// One row of a packet or record: where it stands and how it is shown. Tables of these are what a
// section consists of.
struct Field {
    const char* row;
    std::uint16_t offset; // first byte
    std::uint8_t bit;     // first bit in that byte, 0 the lowest
    std::uint8_t bits;    // 1 to 32
    Format format;
    Coding coding = Coding::Unsigned;

    // The raw number, or nothing when the packet ends before it.
    [[nodiscard]] std::optional<std::int64_t> valueIn(PacketView packet) const;
    // The offset just past the last byte read.
    [[nodiscard]] constexpr std::size_t end() const
    {
        return offset + (static_cast<std::size_t>(bit) + bits + 7) / 8;
    }
};

// A field of `width` whole bytes (1 to 4) at `offset`.
constexpr Field bytesField(const char* row, std::uint16_t offset, unsigned width, Format format,
                           Coding coding = Coding::Unsigned)
{
    return {row, offset, 0, static_cast<std::uint8_t>(8 * width), format, coding};
}

// A field of `bits` bits from bit `bit` of the byte at `offset` on.
constexpr Field bitsField(const char* row, std::uint16_t offset, std::uint8_t bit,
                          std::uint8_t bits, Format format)
{
    return {row, offset, bit, bits, format};
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

// Stores the text under the row's key, reusing what is there.
void setRow(PropertyDictionary* rows, const char* row, std::string text);
// Stores a new array of the elements under the row's key, in place of what is there.
void setListRow(PropertyDictionary* rows, const char* row, std::vector<PropertyValue> elements);

} // namespace orvane
