#pragma once

#include "LogGenerator/Field.h"
#include "platform/base/PacketView.h"
#include "platform/base/PropertyValue.h"

#include <optional>
#include <span>
#include <type_traits>
#include <utility>
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

// The elements of a list that a packet fills anew. An element takes the place of an earlier one:
// where that is a dictionary of readings of the same rows and nobody else holds it, only its
// numbers are changed. Earlier elements that are too many are kept for the next packet. So a list
// whose elements keep their shape costs no memory.
class ListElements
{
public:
    ListElements() = default;
    explicit ListElements(std::vector<PropertyValue> earlier) : _elements(std::move(earlier)) {}

    // Starts a list anew, in place of these elements.
    void begin(std::vector<PropertyValue> earlier);

    // A dictionary of the readings.
    void add(std::span<const Reading> readings);
    // A dictionary of the fields' rows in a record, those of `fields`, then of `others`.
    void add(PacketView record, std::span<const Field> fields, std::span<const Field> others = {});
    // The rows of an element that the caller writes: those of an earlier one where it has as many
    // entries and the first is a reading of `first`, else none. For elements that always have the
    // same entries.
    PropertyDictionary& addRows(const RowDescription& first, std::size_t entries);
    // Any other value.
    void add(PropertyValue element);
    // One dictionary a whole record.
    void addAll(const Records& records, std::span<const Field> fields);

    // What was added.
    [[nodiscard]] std::vector<PropertyValue> take();

private:
    // The rows of the earlier element whose turn it is; null unless they can be changed in place.
    [[nodiscard]] PropertyDictionary* reusable();

    std::vector<PropertyValue> _elements;
    std::size_t _count = 0; // of those added; behind them stand earlier ones
    std::vector<PropertyValue> _spare;
};

// One dictionary a whole record, rows in the fields' order.
std::vector<PropertyValue> recordRows(const Records& records, std::span<const Field> fields);

// Changes the array under the row's key, or a new one, to what fill(ListElements&) adds.
template <typename Fill>
void rewriteListRow(PropertyDictionary* rows, const char* row, Fill fill)
{
    if (!rows)
        return;
    std::vector<PropertyValue> earlier;
    if (const PropertyValue& present = (*rows)[row]; present.isUnsharedArray())
        earlier = present.asArray()->replaceElements({});
    ListElements elements(std::move(earlier));
    fill(elements);
    setListRow(rows, row, elements.take());
}

} // namespace orvane
