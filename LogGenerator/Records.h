#pragma once

#include "LogGenerator/Field.h"
#include "platform/base/PacketView.h"
#include "platform/base/PropertyValue.h"

#include <optional>
#include <span>
#include <type_traits>
#include <vector>

namespace orvane
{

// The repeated records of a packet: `count` of them, the first at `first`, each `stride` bytes
// after the one before. The count is only the packet's claim.
class Records
{
public:
    Records(PacketView packet, std::size_t first, std::size_t stride, std::size_t count)
        : _packet(packet), _first(first), _stride(stride), _count(count)
    {
    }

    [[nodiscard]] std::size_t count() const { return _count; }
    // A window from the record's first byte to the packet's end, which may be short or empty.
    // Throws ArrayOutOfBoundsException for an index that is not below the count.
    [[nodiscard]] PacketView at(std::size_t index) const;

private:
    PacketView _packet;
    std::size_t _first;
    std::size_t _stride;
    std::size_t _count;
};

// Calls `visit` with each record in order, as far as the packet goes: the walk stops at the first
// that is not whole, that is, of which any of the `wholeBytes` bytes is missing. Where that depends
// on what a record holds, `wholeBytes` is a function of the record.
template <typename WholeBytes, typename Visit>
void forEachWholeRecord(const Records& records, WholeBytes wholeBytes, Visit visit)
{
    for (std::size_t i = 0; i < records.count(); ++i) {
        const PacketView record = records.at(i);
        std::size_t needed = 0;
        if constexpr (std::is_invocable_v<WholeBytes, PacketView>)
            needed = wholeBytes(record);
        else
            needed = wholeBytes;
        if (!record.holds(0, needed))
            break;
        visit(record);
    }
}

// One dictionary a whole record, rows in the fields' order.
std::vector<PropertyValue> recordRows(const Records& records, std::span<const Field> fields);

} // namespace orvane
